// The map as a user has it: real widgets, real clicks and drags, real files, with no display.

#include <QClipboard>
#include <QFileDialog>
#include <QImageReader>
#include <QRadioButton>
#include <QSignalSpy>
#include <QToolTip>
#include <cmath>

#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "shell/grid_view.h"
#include "tests/shell/desktop_fixture.h"

namespace gridbay::shell {

class MapTest : public DesktopFixture {
  Q_OBJECT

 private:
  static constexpr int kAreas = 27;
  static constexpr int kBoundaries = 28;
  static constexpr int kDikes = 31;
  static constexpr int kSources = 40;
  static constexpr int kOutputs = 38;

  MapCanvas& canvas() { return window_->map().canvas(); }
  const MapArea& area(int number) { return *canvas().scene().area(number); }
  QPointF screenOf(int number, double j, double k) {
    return canvas().frame().toScreen(area(number).grid.at(j, k));
  }
  QPointF screenOf(MapPoint place) { return canvas().frame().toScreen(place); }

  // Mouse events on their way through the window.
  QPoint inWindow(QPointF at) { return canvas().mapTo(window_.get(), at.toPoint()); }
  void press(QPointF at) { QTest::mousePress(window_->windowHandle(), Qt::LeftButton, {}, inWindow(at)); }
  void moveTo(QPointF at) { QTest::mouseMove(window_->windowHandle(), inWindow(at)); }
  void release(QPointF at) { QTest::mouseRelease(window_->windowHandle(), Qt::LeftButton, {}, inWindow(at)); }
  void click(QPointF at) {
    moveTo(at);
    press(at);
    release(at);
    QCoreApplication::processEvents();
  }
  void doubleClick(QPointF at) {
    moveTo(at);
    QTest::mouseDClick(window_->windowHandle(), Qt::LeftButton, {}, inWindow(at));
    QCoreApplication::processEvents();
  }
  void drag(QPointF from, QPointF to) {
    moveTo(from);
    press(from);
    moveTo((from + to) / 2);
    moveTo(to);
    release(to);
    QCoreApplication::processEvents();
  }
  void settle() { QTRY_VERIFY(canvas().isSettled()); }

  const MapFeature* feature(MapKind kind, int number = 1) {
    for (const MapFeature& each : canvas().scene().features) {
      if (each.id.kind == kind && each.id.number == number) return &each;
    }
    return nullptr;
  }
  QString undoName() {
    const auto edit = tab().editor().undoable();
    return edit ? QString::fromStdString(edit->name) : QString();
  }
  GridModel& cells() { return tab().pane().findChild<GridView*>()->cells(); }
  QString cell(int row, int column) {
    return QString::fromStdString(cells().style(cells().index(row - 1, column - 1)).value);
  }
  // Chooses the file of the next dialogs, one after the other.
  static void chooseFiles(QStringList names) {
    auto* poll = new QTimer(qApp);
    QObject::connect(poll, &QTimer::timeout, qApp, [poll, names = std::move(names)]() mutable {
      auto* files = qobject_cast<QFileDialog*>(QApplication::activeModalWidget());
      if (files == nullptr) return;
      files->findChild<QLineEdit*>()->setText(names.takeFirst());
      if (names.isEmpty()) poll->deleteLater();
      QMetaObject::invokeMethod(files, "accept");
    });
    poll->start(20);
  }

 private slots:
  void initTestCase() { makeFolder(); }
  void cleanupTestCase() { folder_.reset(); }
  void init() {
    makeWindow();
    window_->resize(1500, 900);
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    window_->map().show();
    window_->resizeDocks({&window_->map()}, {700}, Qt::Horizontal);
    QCoreApplication::processEvents();
    settle();
  }
  void cleanup() { window_.reset(); }

  void theKeyShowsAndHidesIt() {
    QTest::keyClick(window_.get(), Qt::Key_M, Qt::ControlModifier);
    QVERIFY(window_->map().isHidden());
    QVERIFY(canvas().editor() == nullptr);
    QTest::keyClick(window_.get(), Qt::Key_M, Qt::ControlModifier);
    QVERIFY(window_->map().isVisible());
    QVERIFY(canvas().editor() != nullptr);
  }

  void itsPlaceIsKeptWithTheWindow() {
    window_->addDockWidget(Qt::LeftDockWidgetArea, &window_->map());
    window_->close();
    window_ = std::make_unique<MainWindow>(libraries());
    QCOMPARE(window_->dockWidgetArea(&window_->map()), Qt::LeftDockWidgetArea);
    QVERIFY(!window_->map().isHidden());
  }

  void itIsTornOff() {
    window_->map().setFloating(true);
    QCoreApplication::processEvents();
    QVERIFY(window_->map().isWindow());
    settle();
    QVERIFY(canvas().editor() != nullptr);
  }

  void allAreasAreInPlaceInTheirColours() {
    QCOMPARE(canvas().scene().areas.size(), std::size_t{2});
    canvas().setLayer(MapLayer::legend, false);
    canvas().setLayer(MapLayer::outlines, false);
    TerrainStyle style;
    style.hillShade = false;
    style.zeroLine = false;
    style.scale = TerrainScale{-12, 5, 1};
    canvas().setStyle(style);
    settle();
    const QImage picture = canvas().grab().toImage();
    // The colour of a point is that of its value, of the inner area where both have one.
    for (const auto& [number, j, k] : {std::tuple{1, 5, 5}, {1, 20, 70}, {2, 10, 10}, {2, 60, 40}}) {
      const QPoint at = screenOf(number, j, k).toPoint();
      Result<TsbFile> grid = TsbFile::open(area(number).file);
      std::vector<float> row(static_cast<std::size_t>(area(number).nx));
      QVERIFY(static_cast<bool>(grid->readRows(1, 0, static_cast<std::size_t>(k), row)));
      const float value = row[static_cast<std::size_t>(j)];
      const QRgb wanted =
          value >= area(number).landValue ? landColour() : terrainColour(style.colours, (value + 12) / 17);
      const QColor shown = picture.pixelColor(at);
      QVERIFY2(std::abs(shown.red() - qRed(wanted)) < 8 && std::abs(shown.green() - qGreen(wanted)) < 8,
               qPrintable(QString("area %1 (%2,%3): %4").arg(number).arg(j).arg(k).arg(value)));
    }
  }

  void whatLiesUnderThePointerIsTold() {
    moveTo(screenOf(1, 2, 3));
    const QString outer = window_->map().readout().text();
    QVERIFY2(outer.contains("area 1 (2,3)"), qPrintable(outer));
    QVERIFY2(outer.contains("E 480") && outer.contains("N 6100") && outer.contains("lon 8.6"),
             qPrintable(outer));
    canvas().setFrame({area(2).grid.at(30, 30), 5, {}});
    moveTo(screenOf(2, 30, 31));
    const QString inner = window_->map().readout().text();
    QVERIFY2(inner.contains("area 2 (30,31)") && inner.contains(" m"), qPrintable(inner));
  }

  void theWheelZoomsAroundThePointer() {
    const QPointF at = screenOf(2, 0, 0);
    const MapPoint there = canvas().frame().toMap(at);
    QWheelEvent wheel(at, canvas().mapToGlobal(at), {}, {0, 120}, Qt::NoButton, {}, Qt::NoScrollPhase, false);
    const double before = canvas().frame().metresPerPixel;
    QCoreApplication::sendEvent(&canvas(), &wheel);
    QVERIFY(canvas().frame().metresPerPixel < before);
    QVERIFY(std::abs(canvas().frame().toMap(at).east - there.east) < 0.01);
    settle();
  }

  void aDragMovesTheMap() {
    const MapPoint there = canvas().frame().toMap({100, 100});
    drag({100, 100}, {160, 130});
    QVERIFY(std::abs(canvas().frame().toMap({160, 130}).north - there.north) < 0.01);
    QVERIFY(undoName().isEmpty());
    settle();
    QTest::keyClick(&canvas(), Qt::Key_Home);
    QVERIFY(std::abs(canvas().frame().toMap({100, 100}).east - there.east) < 0.01);
  }

  void aRowLightsUpAndAClickLeadsToItsRow() {
    tab().goToPlace({.page = PageId::bathymetry, .entries = {{2}}});
    QCOMPARE(canvas().drawing().selection.area, 2);
    tab().goToPage(39);
    QCOMPARE(canvas().drawing().selection.area, 0);
    click(screenOf(2, -0.5, 20));
    QCOMPARE(tab().currentPage(), kAreas);
    QCOMPARE(tab().currentRow(), 2);
    QCOMPARE(canvas().drawing().selection.area, 2);
  }

  void anAreaIsDraggedAndSnaps() {
    const GridPoint before = area(2).origin;
    const QPointF border = screenOf(2, -0.5, 20);
    const double spacing = screenOf(1, 1, 0).x() - screenOf(1, 0, 0).x();
    drag(border, border + QPointF(5.3 * spacing, 0));
    QCOMPARE(area(2).origin.j, before.j + 5);
    QCOMPARE(area(2).origin.k, before.k);
    QCOMPARE(undoName(), QString("Area 2, Origin"));
    tab().goToPage(kAreas);
    QCOMPARE(cell(2, 3), QString("(%1,%2)").arg(before.j + 5).arg(before.k));
    tab().undo();
    QCoreApplication::processEvents();
    QCOMPARE(area(2).origin.j, before.j);
    QVERIFY(undoName().isEmpty());
  }

  void escapeDropsWhatIsHeld() {
    const GridPoint before = area(2).origin;
    const QPointF border = screenOf(2, -0.5, 20);
    moveTo(border);
    press(border);
    moveTo(border + QPointF(40, 0));
    moveTo(border + QPointF(80, 0));
    QVERIFY(canvas().isHolding());
    canvas().setFocus();
    QTest::keyClick(&canvas(), Qt::Key_Escape);
    QVERIFY(!canvas().isHolding());
    release(border + QPointF(80, 0));
    QCOMPARE(area(2).origin.j, before.j);
    QVERIFY(undoName().isEmpty());
  }

  void whatIsTypedIsSeenAtOnceAndInRedWhereItCantBe() {
    tab().goToPage(kAreas);
    QVERIFY(cells().setData(cells().index(1, 2), "40,30", Qt::EditRole));
    QCoreApplication::processEvents();
    QCOMPARE(area(2).origin.j, 40);
    QVERIFY(area(2).fault.empty());
    QVERIFY(cells().setData(cells().index(1, 2), "100,80", Qt::EditRole));
    QCoreApplication::processEvents();
    QVERIFY(!area(2).fault.empty());
    canvas().fit();
    const QString tip = canvas().tipAt(screenOf(2, -0.5, 1));
    QVERIFY2(tip.contains(QString::fromStdString(area(2).fault)), qPrintable(tip));
    const QColor shown = canvas().grab().toImage().pixelColor(
        badgeOf(outlineOf(canvas().frame(), area(2).corners)).toPoint() - QPoint(6, 0));
    QVERIFY(shown.red() > 180 && shown.green() < 80);
  }

  void adviceIsMarkedWhereItLiesAndFixedThere() {
    QTRY_VERIFY(tab().advice().empty());
    QVERIFY(canvas().drawing().marks.empty());
    tab().goToPage(kAreas);
    QVERIFY(cells().setData(cells().index(1, 2), "35,33", Qt::EditRole));
    QTRY_COMPARE(canvas().drawing().marks.size(), std::size_t{1});
    settle();
    const AdviceMark mark = canvas().drawing().marks[0];
    QVERIFY(mark.tip.contains("it belongs at (36,33)"));
    const MapPoint first = area(1).grid.at(35, 33);
    QCOMPARE(mark.place.east, first.east);
    QCOMPARE(mark.place.north, first.north);
    const QPointF lamp = screenOf(mark.place) - QPointF(0, 22);
    QCOMPARE(canvas().tipAt(lamp), mark.tip);
    const auto shown = [&] {
      return canvas().grab().toImage().copy(QRect(lamp.toPoint() - QPoint(9, 9), QSize(19, 19)));
    };
    const QImage with = shown();
    canvas().setLayer(MapLayer::advice, false);
    QVERIFY(shown() != with);
    QCOMPARE(canvas().tipAt(lamp).contains("it belongs at"), false);
    canvas().setLayer(MapLayer::advice, true);
    // A click shows it with its fix, and grasps nothing.
    AdviceStrip& strip = window_->map().adviceStrip();
    QVERIFY(!strip.isVisible());
    tab().goToPage(kSources);
    click(lamp);
    QVERIFY(strip.isVisible());
    QCOMPARE(tab().currentPage(), kSources);
    click(screenOf(1, 2, 2));
    QVERIFY(!strip.isVisible());
    click(screenOf(mark.place) - QPointF(0, 22));
    QTest::mouseClick(strip.findChild<QToolButton*>("fix"), Qt::LeftButton);
    QCOMPARE(undoName(), QString("Move area 2 to (36,33)"));
    QTRY_COMPARE(area(2).origin.j, 36);
    QVERIFY(canvas().drawing().marks.empty());
    QVERIFY(!strip.isVisible());
  }

  void aRectangleBecomesANestedArea() {
    const QPointF from = screenOf(1, 5, 5);
    const QPointF to = screenOf(1, 15, 12);
    window_->map().toolAction(MapTool::nestedArea)->trigger();
    QSignalSpy failed(&window_->map(), &MapDock::failed);
    chooseFiles({file("estuary.tsb2"), file("drawn.tsb2")});
    drag(from, to);
    QTRY_COMPARE(canvas().scene().areas.size(), std::size_t{3});
    QCOMPARE(failed.count(), 0);
    QCOMPARE(area(3).origin.j, 5);
    QCOMPARE(area(3).nx, 31);
    QCOMPARE(area(3).ny, 22);
    QCOMPARE(undoName(), QString("New area 3"));
    QVERIFY(QFile::exists(file("drawn.tsb2")));
    settle();
    tab().undo();
    QCoreApplication::processEvents();
    QCOMPARE(canvas().scene().areas.size(), std::size_t{2});
    QCOMPARE(canvas().tool(), MapTool::select);
  }

  void clicksPlaceASourceAndAPair() {
    window_->map().toolAction(MapTool::source)->trigger();
    click(screenOf(1, 8, 10));
    const MapFeature* source = feature(MapKind::source);
    QVERIFY(source != nullptr);
    QCOMPARE(undoName(), QString("New source"));
    QCOMPARE(tab().currentPage(), kSources);
    QCOMPARE(tab().currentRow(), source->row);
    QVERIFY(canvas().drawing().selection.feature == source->id);
    window_->map().toolAction(MapTool::pair)->trigger();
    click(screenOf(1, 10, 20));
    QVERIFY(canvas().isHolding());
    click(screenOf(1, 14, 20));
    QCOMPARE(feature(MapKind::source, 2)->points->size(), std::size_t{2});
    QCOMPARE(feature(MapKind::source, 2)->drive, MapDrive::pair);
    tab().undo();
    tab().undo();
    QCoreApplication::processEvents();
    QVERIFY(feature(MapKind::source) == nullptr);
  }

  void aSourceIsDragged() {
    window_->map().toolAction(MapTool::source)->trigger();
    click(screenOf(1, 8, 10));
    window_->map().toolAction(MapTool::select)->trigger();
    drag(screenOf(1, 8, 10), screenOf(1, 11, 14));
    const MapPoint there = feature(MapKind::source)->points->front();
    QVERIFY(std::abs(there.east - area(1).grid.at(11, 14).east) < 0.01);
    QVERIFY(undoName().startsWith("Source 1"));
  }

  void theEndsOfABoundarySlideAlongTheBorder() {
    tab().goToPage(kBoundaries);
    for (auto* button : tab().pane().findChildren<QRadioButton*>()) {
      if (button->text().remove('&') == "User specified") button->click();
    }
    QCoreApplication::processEvents();
    int number = 1;  // of the new one, after those that were found
    while (feature(MapKind::boundary, number) != nullptr) ++number;
    window_->map().toolAction(MapTool::boundary)->trigger();
    click(screenOf(1, 0, 10));
    click(screenOf(1, 0, 40));
    QVERIFY(feature(MapKind::boundary, number) != nullptr);
    QCOMPARE(undoName(), QString("New boundary"));
    window_->map().toolAction(MapTool::select)->trigger();
    // Off the border, and it slides along it all the same.
    drag(screenOf(1, 0, 40), screenOf(1, 6, 55));
    const MapPoint end = feature(MapKind::boundary, number)->points->back();
    QVERIFY(std::abs(end.east - area(1).grid.at(0, 55).east) < 0.01);
    QVERIFY(std::abs(end.north - area(1).grid.at(0, 55).north) < 0.01);
    QCOMPARE(undoName(), QString("Boundary %1, Last point").arg(number));
    tab().undo();
    QCoreApplication::processEvents();
    const MapPoint back = feature(MapKind::boundary, number)->points->back();
    QVERIFY(std::abs(back.north - area(1).grid.at(0, 40).north) < 0.01);
  }

  void aDikeIsDrawnAndEditedPointByPoint() {
    window_->map().toolAction(MapTool::dike)->trigger();
    click(screenOf(1, 20, 60));
    click(screenOf(1, 30, 60));
    click(screenOf(1, 40, 70));
    click(screenOf(1, 50, 80));
    canvas().setFocus();
    QTest::keyClick(&canvas(), Qt::Key_Backspace);
    QTest::keyClick(&canvas(), Qt::Key_Return);
    QCOMPARE(feature(MapKind::dike)->points->size(), std::size_t{3});
    QCOMPARE(undoName(), QString("New Dike"));
    QCOMPARE(tab().currentPage(), kDikes);
    window_->map().toolAction(MapTool::select)->trigger();

    drag(screenOf(1, 30, 60), screenOf(1, 30, 50));
    QCOMPARE(undoName(), QString("Dike 1, point 2"));
    const MapPoint moved = (*feature(MapKind::dike)->points)[1];
    QVERIFY(std::abs(moved.north - area(1).grid.at(30, 50).north) < 2 * canvas().frame().metresPerPixel);

    doubleClick(screenOf(1, 35, 60));
    QCOMPARE(feature(MapKind::dike)->points->size(), std::size_t{4});
    QCOMPARE(undoName(), QString("Dike 1, new point"));

    click(screenOf((*feature(MapKind::dike)->points)[2]));
    QCOMPARE(canvas().drawing().selection.vertex, std::optional(std::size_t{2}));
    canvas().setFocus();
    QTest::keyClick(&canvas(), Qt::Key_Delete);
    QCOMPARE(feature(MapKind::dike)->points->size(), std::size_t{3});
    QCOMPARE(undoName(), QString("Dike 1, point removed"));
    for (int i = 0; i < 4; ++i) tab().undo();
    QCoreApplication::processEvents();
    QVERIFY(feature(MapKind::dike) == nullptr);
    QVERIFY(undoName().isEmpty());
  }

  void aWeirEndsWithADoubleClick() {
    window_->map().toolAction(MapTool::weir)->trigger();
    click(screenOf(1, 20, 60));
    click(screenOf(1, 30, 60));
    doubleClick(screenOf(1, 30, 60));
    QVERIFY(feature(MapKind::weir) != nullptr);
    QCOMPARE(feature(MapKind::weir)->points->size(), std::size_t{2});
  }

  void outputsArePlaced() {
    window_->map().toolAction(MapTool::outputArea)->trigger();
    drag(screenOf(1, 5, 5), screenOf(1, 25, 15));
    QCOMPARE(tab().currentPage(), kOutputs);
    const int first = [&] {
      for (const MapFeature& each : canvas().scene().features) {
        if (each.id.kind == MapKind::outputMap && each.id.number > 1) return each.id.number;
      }
      return 1;
    }();
    QVERIFY(feature(MapKind::outputMap, first) != nullptr);
    window_->map().toolAction(MapTool::outputLine)->trigger();
    click(screenOf(1, 5, 20));
    click(screenOf(1, 25, 20));
    QVERIFY(feature(MapKind::outputLine, first + 1) != nullptr);
    window_->map().toolAction(MapTool::outputPoint)->trigger();
    click(screenOf(1, 10, 30));
    const MapFeature* point = feature(MapKind::outputPoints, first + 2);
    QVERIFY(point != nullptr);
    QVERIFY(std::abs(point->points->front().east - area(1).grid.at(10, 30).east) < 0.01);
  }

  void whatCantBeDoneIsTold() {
    QSignalSpy failed(&window_->map(), &MapDock::failed);
    window_->map().toolAction(MapTool::source)->trigger();
    click(QPointF(3, canvas().height() / 2.0));
    QCOMPARE(failed.count(), 1);
    QVERIFY(undoName().isEmpty());
    QVERIFY(!window_->map().readout().text().trimmed().isEmpty());
  }

  void aCellIsPickedOnTheMap() {
    tab().goToPlace({.page = PageId::bathymetry, .entries = {{2}}, .column = 3});
    QVERIFY(tab().pane().pointCell().has_value());
    QTest::keyClick(window_.get(), Qt::Key_M, Qt::ControlModifier | Qt::ShiftModifier);
    QCOMPARE(canvas().tool(), MapTool::pick);
    click(screenOf(1, 20, 25));
    QCOMPARE(cell(2, 3), QString("(20,25)"));
    QCOMPARE(area(2).origin.k, 25);
    QCOMPARE(canvas().tool(), MapTool::select);
    tab().undo();
    QVERIFY(undoName().isEmpty());
  }

  void aCellWithNoPointIsNotPicked() {
    QSignalSpy failed(&window_->map(), &MapDock::failed);
    tab().goToPlace({.page = PageId::bathymetry, .entries = {{1}}, .column = 1});
    window_->map().startPick();
    QCOMPARE(failed.count(), 1);
    QCOMPARE(canvas().tool(), MapTool::select);
  }

  void layersAndColoursAreSet() {
    const QImage all = canvas().grab().toImage();
    for (int i = 0; i < window_->map().layers().count(); ++i) {
      QListWidgetItem* item = window_->map().layers().item(i);
      if (item->text() == "Terrain") item->setCheckState(Qt::Unchecked);
    }
    QVERIFY(canvas().grab().toImage() != all);
    canvas().setLayer(MapLayer::terrain, true);
    window_->map().automatic().setChecked(false);
    window_->map().least().setValue(-2);
    window_->map().greatest().setValue(3);
    QCOMPARE(canvas().scale()->least, -2.0F);
    QCOMPARE(canvas().scale()->greatest, 3.0F);
    window_->map().colours().setCurrentIndex(1);
    QCOMPARE(canvas().terrainStyle().colours, TerrainColours::sea);
    window_->map().automatic().setChecked(true);
    QTRY_VERIFY(canvas().scale() && canvas().scale()->least < -5);
  }

  void eachDocumentKeepsItsPartOfTheMap() {
    run("v27setup", {"new", "t.v27", "--force", "--area", "inlet.tsb2"});
    const MapFrame frame{area(2).grid.at(3, 4), 7, canvas().frame().size};
    canvas().setFrame(frame);
    DocumentTab* first = &tab();
    QVERIFY(window_->openDocument(file("t.v27")) != nullptr);
    QCOMPARE(canvas().scene().areas.size(), std::size_t{1});
    QVERIFY(window_->openDocument(file("s.v27")) == first);
    QCOMPARE(canvas().scene().areas.size(), std::size_t{2});
    QCOMPARE(canvas().frame().metresPerPixel, 7.0);
    QCOMPARE(canvas().frame().centre.east, frame.centre.east);
  }

  void aSetupWithNoGridHasAnEmptyMap() {
    window_->newDocument(0);
    QCoreApplication::processEvents();
    QVERIFY(canvas().terrain().empty());
    QVERIFY(!canvas().grab().isNull());
    moveTo({50, 50});
    click({50, 50});
    canvas().fit();
  }

  void aDamagedGridIsTold() {
    QVERIFY(QFile::copy(file("inlet.tsb2"), file("broken.tsb2")));
    run("v27setup", {"new", "d.v27", "--force", "--area", "estuary.tsb2", "--area", "broken.tsb2@36,33"});
    write(file("broken.tsb2"), "nothing of this kind");
    answers({QMessageBox::Ok}, [&] { window_->openDocument(file("d.v27")); });
    QVERIFY(!area(2).isPlaced);
    QVERIFY(!area(2).fault.empty());
    QCOMPARE(canvas().terrain().size(), std::size_t{1});
    QFile::remove(file("broken.tsb2"));
  }

  void itIsExported() {
    settle();
    for (const QString name : {"map.png", "map.svg", "map.pdf"}) {
      QCOMPARE(window_->map().exportTo(file(name)), QString());
      QVERIFY(QFileInfo(file(name)).size() > 5000);
    }
    const QImage picture(file("map.png"));
    QCOMPARE(picture.width(), 2 * canvas().width());
    const QImage shown = canvas().grab().toImage();
    const QPoint at = screenOf(1, 10.2, 40.2).toPoint();
    QVERIFY(std::abs(picture.pixelColor(at * 2).green() - shown.pixelColor(at).green()) < 40);
    QVERIFY(textOf(file("map.svg")).contains("<svg"));
    QFile page(file("map.pdf"));
    QVERIFY(page.open(QFile::ReadOnly));
    QCOMPARE(page.read(5), QByteArray("%PDF-"));
    QVERIFY(!window_->map().exportTo(file("map.bmp")).isEmpty());
    QVERIFY(window_->map().exportTo(file("no/such/map.png")).contains("no/such/map.png"));
  }

  void aTurnedGridIsPaintedPointByPoint() {
    TsbDefinition definition;
    definition.axes = {{.points = 40, .spacing = 10}, {.points = 30, .spacing = 10}};
    definition.items = {{.name = "Bathymetry", .type = item::kBathymetry, .unit = "m", .isDouble = true}};
    Result<TsbWriter> writer = TsbWriter::create(file("turned.tsb2").toStdString(), definition);
    std::vector<double> values;
    for (int k = 0; k < 30; ++k) {
      for (int j = 0; j < 40; ++j) values.push_back(-static_cast<double>(j + k));
    }
    QVERIFY(writer && writer->write(1, 0, std::span<const double>(values)) && writer->commit());
    Result<StoredGrid> grid = StoredGrid::open(file("turned.tsb2").toStdString(), 1);
    QVERIFY(static_cast<bool>(grid));
    const double c = std::cos(0.5);
    const double s = std::sin(0.5);
    TerrainRequest request;
    request.areas = {{std::make_shared<const StoredGrid>(std::move(*grid)),
                      {{100, 100}, {10 * c, -10 * s}, {10 * s, 10 * c}},
                      5}};
    request.frame = {{300, 150}, 1, {600, 500}};
    request.style = {.scale = TerrainScale{-70, 0, 1}, .hillShade = false, .zeroLine = false};
    const auto picture = paintTerrain(request, 1, [] { return false; });
    QVERIFY(picture.has_value());
    for (const auto& [j, k] : {std::pair{0, 0}, {39, 29}, {20, 3}, {7, 22}}) {
      const QPointF at = request.frame.toScreen(request.areas[0].grid.at(j, k));
      const QColor wanted(terrainColour(request.style.colours, (70 - j - k) / 70.0));
      const QColor shown = picture->image.pixelColor(at.toPoint());
      QVERIFY(std::abs(shown.red() - wanted.red()) < 3 && std::abs(shown.green() - wanted.green()) < 3);
    }
    QCOMPARE(qAlpha(picture->image.pixel(request.frame.toScreen(request.areas[0].grid.at(-2, 10)).toPoint())),
             0);
    QVERIFY(!paintTerrain(request, 1, [] { return true; }).has_value());
    QVERIFY(!StoredGrid::open(file("turned.tsb2").toStdString(), 2));
    QVERIFY(!StoredGrid::open(file("none.tsb2").toStdString(), 1));
  }
};

}  // namespace gridbay::shell

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("map-test");
  gridbay::shell::MapTest test;
  return QTest::qExec(&test, argc, argv);
}

#include "map_test.moc"
