// The map as a user has it: real widgets, real clicks and drags, real files, with no display.

#include <QClipboard>
#include <QFileDialog>
#include <QImageReader>
#include <QRadioButton>
#include <QSignalSpy>
#include <QToolTip>
#include <cmath>
#include <set>

#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "shell/grid_view.h"
#include "tests/shell/desktop_fixture.h"

namespace gridbay::shell {

class MapTest : public DesktopFixture {
  Q_OBJECT

 private:
  static constexpr int kFloodAndDry = 26;
  static constexpr int kAreas = 27;
  static constexpr int kBoundaries = 28;
  static constexpr int kDikes = 31;
  static constexpr int kSources = 40;
  static constexpr int kOutputs = 38;
  static constexpr int kModules = 35;
  static constexpr int kMassBudgets = 34;

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
  void settle() { QTRY_VERIFY_WITH_TIMEOUT(canvas().isSettled(), 30000); }

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
  void chooseModule(const QString& name) {
    QVERIFY(tab().goToPage(kModules));
    for (auto* button : tab().pane().findChildren<QRadioButton*>()) {
      if (button->text().remove('&') == name) button->click();
    }
    QCoreApplication::processEvents();
  }
  // The item of a layer or background in the list.
  QListWidgetItem* layer(const QString& text) {
    QListWidget& list = window_->map().panel().layers();
    const auto found = list.findItems(text, Qt::MatchStartsWith);
    return found.isEmpty() ? nullptr : found.front();
  }
  void press(const char* button) {
    QToolButton* found = window_->map().panel().button(button);
    QVERIFY2(found != nullptr && found->isEnabled(), button);
    QTest::mouseClick(found, Qt::LeftButton);
  }
  QColor shownAt(QPointF at) {
    settle();
    QCoreApplication::processEvents();
    return canvas().grab().toImage().pixelColor(at.toPoint());
  }
  // A raster over Area 1, black in the west and white in the east, in the projection of the
  // map or in none.
  QString halves(const QString& name, bool hasProjection) {
    const MapArea& outer = area(1);
    const MapPoint low = outer.grid.at(-0.5, -0.5);
    const double width = outer.nx * outer.dx;
    constexpr int kHalf = 20;  // columns
    const QString row = QString("0 ").repeated(kHalf) + QString("100 ").repeated(kHalf) + "\n";
    write(file("halves.asc"), (QString("ncols %1\nnrows %1\nxllcorner %2\nyllcorner %3\ncellsize %4\n")
                                   .arg(2 * kHalf)
                                   .arg(low.east, 0, 'f', 3)
                                   .arg(low.north, 0, 'f', 3)
                                   .arg(width / (2 * kHalf), 0, 'f', 3) +
                               row.repeated(2 * kHalf))
                                  .toUtf8());
    QStringList arguments{"-q", file("halves.asc"), file(name)};
    if (hasProjection) arguments = QStringList{"-a_srs", "EPSG:32632"} + arguments;
    if (QProcess::execute("gdal_translate", arguments) != 0) qFatal("no raster");
    return file(name);
  }
  static void runTool(const QStringList& command) {
    if (QProcess::execute(command.front(), command.mid(1)) != 0) qFatal("%s", qPrintable(command.join(' ')));
  }
  // The same halves as netCDF, by the name of its file.
  QString netcdf(const QString& name, const QStringList& options = {}) {
    runTool(QStringList{"gdal_translate", "-q", "-of", "netCDF"} + options +
            QStringList{halves("halves.tif", true), file(name)});
    return file(name);
  }
  // What is wrong with an export, or empty.
  QString exported(const QString& name) {
    QSignalSpy ended(&window_->map(), &MapDock::exported);
    window_->map().exportTo(file(name));
    if (ended.isEmpty()) ended.wait(30000);
    return ended.isEmpty() ? "it has not ended" : ended[0][1].toString();
  }
  void showBackgroundsAlone() {
    for (const MapLayer each : {MapLayer::terrain, MapLayer::gridLines, MapLayer::outlines})
      canvas().setLayer(each, false);
  }
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
    // With a longer step there is advice, and a mark on the map.
    run("v27setup", {"set", "s.v27", "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Time_Step_Interval=3"});
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

  void behindAnotherDockItDoesNothing() {
    window_->tabifyDockWidget(&window_->map(), &window_->help());
    window_->help().show();
    window_->help().raise();
    QTRY_VERIFY(canvas().editor() == nullptr);
    tab().goToPage(kAreas);
    QVERIFY(cells().setData(cells().index(1, 2), "40,30", Qt::EditRole));
    QCoreApplication::processEvents();
    QVERIFY(canvas().terrain().empty());
    window_->map().raise();
    QTRY_VERIFY(canvas().editor() != nullptr);
    QCOMPARE(area(2).origin.j, 40);
    tab().undo();
    // Picking brings it to the front.
    tab().goToPlace({.page = PageId::bathymetry, .entries = {{2}}, .column = 3});
    window_->help().raise();
    QTRY_VERIFY(canvas().editor() == nullptr);
    window_->map().startPick();
    QTRY_VERIFY(canvas().editor() != nullptr);
    QCOMPARE(canvas().tool(), MapTool::pick);
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
    constexpr int number = 1;
    window_->map().toolAction(MapTool::boundary)->trigger();
    click(screenOf(1, 0, 10));
    click(screenOf(1, 0, 40));
    QVERIFY(feature(MapKind::boundary, number) != nullptr);
    QCOMPARE(undoName(), QString("Boundary 1, both ends"));  // of the one that was found there
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

  void theCellsOfAPartArePickedTogether() {
    window_->map().toolAction(MapTool::outputArea)->trigger();
    drag(screenOf(1, 5, 5), screenOf(1, 25, 15));
    tab().goToPlace({.page = PageId::hdResult, .entries = {{1}}, .column = 4});
    const QString before = cell(1, 3) + " " + cell(1, 4);
    QTest::keyClick(window_.get(), Qt::Key_M, Qt::ControlModifier | Qt::ShiftModifier);
    QVERIFY(window_->map().pickAction()->isChecked());
    QVERIFY2(window_->map().hint().text().startsWith("J and K, row 1: click on one corner."),
             qPrintable(window_->map().hint().text()));
    // What is held is ringed.
    const QPoint ring = screenOf(1, 5, 5).toPoint() - QPoint(8, 0);
    const QImage picked = canvas().grab().toImage();
    click(screenOf(1, 30, 25));
    QVERIFY(window_->map().hint().text().contains("opposite corner"));
    QCOMPARE(cell(1, 3) + " " + cell(1, 4), before);
    click(screenOf(1, 12, 40));
    QCOMPARE(cell(1, 3), QString("12-30,1"));
    QCOMPARE(cell(1, 4), QString("25-40,1"));
    QCOMPARE(undoName(), QString("J and K, row 1"));
    QCOMPARE(canvas().tool(), MapTool::select);
    QVERIFY(!window_->map().pickAction()->isChecked());
    QVERIFY(canvas().grab().toImage().pixelColor(ring) != picked.pixelColor(ring));
    tab().undo();
    QCOMPARE(undoName(), QString("New output"));
    QCOMPARE(cell(1, 3) + " " + cell(1, 4), before);
  }

  void aPickFollowsTheCellAndEndsWithItsPage() {
    QSignalSpy failed(&window_->map(), &MapDock::failed);
    window_->map().toolAction(MapTool::pair)->trigger();
    click(screenOf(1, 8, 10));
    click(screenOf(1, 12, 10));
    tab().goToPlace({.page = PageId::sourceAndSink, .entries = {{1}}, .column = 2});
    window_->map().startPick();
    QVERIFY(window_->map().hint().text().startsWith("Source, row 1"));
    // Esc puts it down, off the grid there is no point, and another cell is picked for from then on.
    QTest::keyClick(&canvas(), Qt::Key_Escape);
    QCOMPARE(canvas().tool(), MapTool::select);
    window_->map().startPick();
    click(QPointF(3, canvas().height() / 2.0));
    QCOMPARE(failed.count(), 1);
    QCOMPARE(canvas().tool(), MapTool::pick);
    tab().pane().goTo({.entries = {{1}}, .column = 4});
    QVERIFY(window_->map().hint().text().startsWith("Sink, row 1"));
    click(screenOf(2, 30, 30));  // its area follows
    QCOMPARE(cell(2, 4), QString("(30,30)"));
    QCOMPARE(cell(2, 5), QString("2"));
    window_->map().startPick();
    tab().goToPage(kAreas);
    QCOMPARE(canvas().tool(), MapTool::select);
    // From the menu of a cell.
    tab().goToPage(kSources);
    auto* table = tab().pane().findChild<GridView*>();
    const QPoint at = table->visualRect(table->model()->index(1, 1)).center();
    QTimer::singleShot(100, qApp, [] {
      auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
      if (menu != nullptr) {
        QTest::keyClick(menu, Qt::Key_Down);
        QTest::keyClick(menu, Qt::Key_Return);
      }
    });
    QContextMenuEvent wanted(QContextMenuEvent::Mouse, at, table->viewport()->mapToGlobal(at));
    QCoreApplication::sendEvent(table->viewport(), &wanted);
    QCOMPARE(canvas().tool(), MapTool::pick);
    QVERIFY(window_->map().hint().text().startsWith("Source, row 1"));
  }

  void theToolInHandIsShown() {
    MapDock& map = window_->map();
    const QString select = map.hint().text();
    const QSize size = canvas().size();
    QVERIFY(select.startsWith("Click to choose"));
    QVERIFY(!map.placeButton().isChecked());
    map.toolAction(MapTool::dike)->trigger();
    QVERIFY(map.placeButton().isChecked());
    QCOMPARE(map.placeButton().text(), QString("Place: Dike"));
    QCOMPARE(canvas().cursor().shape(), Qt::CrossCursor);
    QCOMPARE(map.hint().text(), QString("Dike: click on the first point. Esc puts it down."));
    QCOMPARE(canvas().size(), size);
    click(screenOf(1, 20, 60));
    QCOMPARE(map.hint().text(),
             QString("Dike: click on the next point. Backspace takes the last click back, Esc all."));
    click(screenOf(1, 30, 60));
    QVERIFY(map.hint().text().contains("Return ends."));
    QTest::keyClick(&canvas(), Qt::Key_Backspace);
    QVERIFY(!map.hint().text().contains("Return ends."));
    QTest::keyClick(&canvas(), Qt::Key_Escape);
    QVERIFY(map.hint().text().contains("first point"));
    QTest::keyClick(&canvas(), Qt::Key_Escape);
    QCOMPARE(map.hint().text(), select);
    QVERIFY(!map.placeButton().isChecked());
    QCOMPARE(map.placeButton().text(), QString("Place"));
    QVERIFY(map.toolAction(MapTool::select)->isChecked());
    QCOMPARE(canvas().cursor().shape(), Qt::ArrowCursor);
    QVERIFY(undoName().isEmpty());
  }

  void aPressEntersWhatIsTypedBeforeItGrasps() {
    QVERIFY(tab().goToPage(kFloodAndDry));
    const GridPoint before = area(2).origin;
    type("Drying depth:", "0.25");
    QVERIFY(undoName().isEmpty());
    const QPointF border = screenOf(2, -0.5, 20);
    const double spacing = screenOf(1, 1, 0).x() - screenOf(1, 0, 0).x();
    drag(border, border + QPointF(3.2 * spacing, 0));
    QCOMPARE(area(2).origin.j, before.j + 3);
    QCOMPARE(undoName(), QString("Area 2, Origin"));
    QVERIFY(edit("Drying depth:").text().startsWith("0.25"));
    tab().undo();
    QCOMPARE(undoName(), QString("Drying depth"));
    tab().undo();
    QVERIFY(undoName().isEmpty());
    // What was typed may take away what is under the pointer: then nothing is grasped.
    tab().goToPlace({.page = PageId::bathymetry, .entries = {{2}}, .column = 3});
    auto* table = tab().pane().findChild<GridView*>();
    QTest::keyClick(table, Qt::Key_F2);
    QTest::keyClicks(QApplication::focusWidget(), "50,60");
    drag(screenOf(2, -0.5, 20), screenOf(2, -0.5, 20) + QPointF(3.2 * spacing, 0));
    QCOMPARE(area(2).origin.j, 50);
    QCOMPARE(area(2).origin.k, 60);
    QCOMPARE(undoName(), QString("Origin, row 2"));
  }

  void aBoundaryThatIsDrawnLeadsToWhatDrivesIt() {
    QVERIFY(feature(MapKind::boundary) != nullptr);
    int next = 1;  // after those that were found
    while (feature(MapKind::boundary, next) != nullptr) ++next;
    const std::vector<MapPoint> found = *feature(MapKind::boundary)->points;
    window_->map().toolAction(MapTool::boundary)->trigger();
    click(screenOf(1, 0, 30));
    click(screenOf(1, 0, 50));  // over what was found, whose place it takes
    QCOMPARE(undoName(), QString("Boundary 1, both ends"));
    QVERIFY(feature(MapKind::boundary, next) == nullptr);
    QCOMPARE(canvas().tool(), MapTool::select);
    window_->map().toolAction(MapTool::boundary)->trigger();
    click(screenOf(1, 0, 60));
    click(screenOf(1, 0, 70));
    QCOMPARE(undoName(), QString("New boundary"));
    QVERIFY(feature(MapKind::boundary, next) != nullptr);
    QCOMPARE(tab().currentPage(), static_cast<int>(PageId::hdBoundary));
    // The keyboard is on the cell of the level.
    auto* table = tab().pane().findChild<GridView*>();
    QVERIFY(table->hasFocus() || table->isAncestorOf(QApplication::focusWidget()));
    QCOMPARE(tab().pane().currentCell().row, 6 * (next - 1) + 3);
    QCOMPARE(tab().pane().currentCell().column, 2);
    QTest::keyClick(QApplication::focusWidget(),
                    Qt::Key_2);  // opens the editor, which has the keyboard from here
    QTest::keyClicks(QApplication::focusWidget(), ".5");
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
    QCoreApplication::processEvents();  // it is entered by a queued call
    QCOMPARE(table->model()->index(6 * (next - 1) + 2, 1).data(Qt::EditRole).toString().toDouble(), 2.5);
    for (int i = 0; i < 3; ++i) tab().undo();
    QCoreApplication::processEvents();
    QVERIFY(undoName().isEmpty());
    QCOMPARE(*feature(MapKind::boundary)->points, found);
  }

  void aBoundaryOfNoLengthIsRefused() {
    QSignalSpy failed(&window_->map(), &MapDock::failed);
    window_->map().toolAction(MapTool::boundary)->trigger();
    click(screenOf(1, 0, 30));
    click(screenOf(1, 0, 30.3));
    QCOMPARE(failed.count(), 1);
    QVERIFY(window_->map().readout().text().contains("shorter than the spacing"));
    QVERIFY(undoName().isEmpty());
    // The first click stands.
    QVERIFY(canvas().isHolding());
    click(screenOf(1, 0, 50));
    drag(screenOf(1, 0, 50), screenOf(1, 0, 30.2));
    QCOMPARE(failed.count(), 2);
    QVERIFY(window_->map().readout().text().contains("two ends that differ"));
    QCOMPARE(undoName(), QString("Boundary 1, both ends"));
  }

  void anAreaStaysInTheOneAroundIt() {
    const QPointF border = screenOf(2, -0.5, 20);
    drag(border, border - QPointF(3000, -3000));
    QCOMPARE(area(2).origin.j, 1);
    QCOMPARE(area(2).origin.k, 1);
    QVERIFY2(area(2).fault.empty(), area(2).fault.c_str());
    QCOMPARE(undoName(), QString("Area 2, Origin"));
    tab().undo();
    QVERIFY(undoName().isEmpty());
  }

  void nothingComesOfWhatIsGivenUp() {
    window_->map().toolAction(MapTool::source)->trigger();
    click(screenOf(1, 8, 10));
    QTest::keyClick(&canvas(), Qt::Key_Escape);
    const MapPoint there = feature(MapKind::source)->points->front();
    // Esc while a point is dragged, and Delete, which waits until it is let go.
    moveTo(screenOf(1, 8, 10));
    press(screenOf(1, 8, 10));
    moveTo(screenOf(1, 12, 20));
    moveTo(screenOf(1, 14, 20));
    QVERIFY(canvas().isHolding());
    QTest::keyClick(&canvas(), Qt::Key_Delete);
    QVERIFY(canvas().isHolding());
    QVERIFY(feature(MapKind::source) != nullptr);
    QTest::keyClick(&canvas(), Qt::Key_Escape);
    moveTo(screenOf(1, 16, 20));
    release(screenOf(1, 16, 20));
    QCoreApplication::processEvents();
    QCOMPARE(feature(MapKind::source)->points->front(), there);
    QCOMPARE(undoName(), QString("New source"));
    // Off all areas: a press, a double click, the wheel, and a press that pans.
    const QPointF off(4, 4);
    const double scale = canvas().frame().metresPerPixel;
    click(off);
    doubleClick(off);
    QWheelEvent wheel(off, canvas().mapToGlobal(off), {}, {0, -120}, Qt::NoButton, {}, Qt::NoScrollPhase,
                      false);
    QCoreApplication::sendEvent(&canvas(), &wheel);
    QVERIFY(canvas().frame().metresPerPixel > scale);
    drag(off, off + QPointF(30, 20));
    QVERIFY(!canvas().isHolding());
    QCOMPARE(undoName(), QString("New source"));
    // The wheel while a point is held: it goes where it is let go.
    canvas().fit();
    const QPointF from = screenOf(1, 8, 10);
    click(from);
    moveTo(from);
    press(from);
    moveTo(from + QPointF(20, 0));
    QWheelEvent closer(from, canvas().mapToGlobal(from), {}, {0, 120}, Qt::LeftButton, {}, Qt::NoScrollPhase,
                       false);
    QCoreApplication::sendEvent(&canvas(), &closer);
    const QPointF to = screenOf(1, 12, 14);
    moveTo(to);
    release(to);
    QCoreApplication::processEvents();
    QVERIFY(std::abs(feature(MapKind::source)->points->front().east - area(1).grid.at(12, 14).east) < 0.01);
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
    for (int i = 0; i < window_->map().panel().layers().count(); ++i) {
      QListWidgetItem* item = window_->map().panel().layers().item(i);
      if (item->text() == "Terrain") item->setCheckState(Qt::Unchecked);
    }
    QVERIFY(canvas().grab().toImage() != all);
    canvas().setLayer(MapLayer::terrain, true);
    window_->map().panel().automatic().setChecked(false);
    window_->map().panel().least().setValue(-2);
    window_->map().panel().greatest().setValue(3);
    QCOMPARE(canvas().scale()->least, -2.0F);
    QCOMPARE(canvas().scale()->greatest, 3.0F);
    window_->map().panel().colours().setCurrentIndex(1);
    QCOMPARE(canvas().terrainStyle().colours, TerrainColours::sea);
    window_->map().panel().automatic().setChecked(true);
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
      QCOMPARE(exported(name), QString());
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
    QVERIFY(exported("map.bmp").contains(".svg"));
    QVERIFY(exported("no/such/map.png").contains("no/such/map.png"));
  }

  void theExportWaitsForAGridThatIsNotOpen() {
    constexpr std::size_t kPoints = 6000;
    TsbDefinition definition;
    definition.time.type = TsbTimeAxisType::relativeEquidistant;
    definition.axes = {{.points = kPoints, .spacing = 10}, {.points = kPoints, .spacing = 10}};
    definition.items = {{.name = "Bathymetry", .type = item::kBathymetry, .unit = "m"}};
    definition.geography = TsbGeography{"UTM-32", 9, 54};
    Result<TsbWriter> writer = TsbWriter::create(file("fine.tsb2").toStdString(), definition);
    QVERIFY(static_cast<bool>(writer));
    for (std::size_t k = 0; k < kPoints; ++k) {
      // Uneven, so that the unpacking takes a while.
      std::vector<float> row(kPoints);
      for (std::size_t j = 0; j < kPoints; ++j)
        row[j] = (k < kPoints / 2 ? -2.0F : -9.0F) + static_cast<float>((j * 7919 + k * 104729) % 97) * 1e-3F;
      QVERIFY(static_cast<bool>(writer->writeRows(1, 0, k, row)));
    }
    QVERIFY(static_cast<bool>(writer->commit()));
    runTool({"nccopy", "-d", "1", file("fine.tsb2"), file("large.tsb2")});
    run("v27setup", {"new", "l.v27", "--force", "--area", "large.tsb2"});
    window_->map().hide();
    QVERIFY(window_->openDocument(file("l.v27")) != nullptr);
    window_->map().show();
    const TerrainGrid& grid = *canvas().terrain()[0].values;
    QSignalSpy ended(&window_->map(), &MapDock::exported);
    // Stopped, and nothing is written.
    window_->map().exportTo(file("stopped.png"));
    QVERIFY(!grid.isTried());
    QVERIFY(window_->map().exportStrip().isVisible());
    QTest::mouseClick(&window_->map().exportStrip().cancel(), Qt::LeftButton);
    QVERIFY(!window_->map().exportStrip().isVisible());
    QVERIFY(!QFile::exists(file("stopped.png")));
    window_->map().exportTo(file("large.png"));
    QVERIFY(ended.isEmpty());  // it goes on beside the window
    QVERIFY(ended.wait(30000));
    QCOMPARE(ended[0][1].toString(), QString());
    QVERIFY(grid.opened() != nullptr);
    settle();
    const QPoint at = screenOf(1, kPoints / 2.0, kPoints / 4.0).toPoint();
    const QColor shown = canvas().grab().toImage().pixelColor(at);
    const QColor written = QImage(file("large.png")).pixelColor(2 * at);
    QVERIFY2(std::abs(written.green() - shown.green()) < 40, qPrintable(written.name() + " " + shown.name()));
    for (const char* name : {"fine.tsb2", "large.tsb2"}) QFile::remove(file(name));
  }

  void aRasterIsABackground() {
    LayerPanel& panel = window_->map().panel();
    panel.show();
    canvas().setLayer(MapLayer::terrain, false);
    canvas().setLayer(MapLayer::outlines, false);
    canvas().setLayer(MapLayer::gridLines, false);
    QCoreApplication::processEvents();
    const QPointF west = screenOf(1, 10, 80);
    const QPointF east = screenOf(1, area(1).nx - 10, 80);
    const QColor paper = shownAt(west);
    panel.addBackground(halves("halves.tif", true));
    QVERIFY2(shownAt(west).lightness() < 10, qPrintable(shownAt(west).name()));
    QVERIFY(shownAt(east).lightness() > 245);
    QListWidgetItem* item = layer("halves.tif");
    QVERIFY(item != nullptr);
    QCOMPARE(panel.layers().row(item), panel.layers().count() - 1);  // below the terrain
    QVERIFY(!item->text().contains("(!)"));
    // Half of it, hidden, and above the terrain.
    panel.layers().setCurrentItem(item);
    panel.opacity().setValue(0);
    QCOMPARE(shownAt(west), paper);
    panel.opacity().setValue(100);
    layer("halves.tif")->setCheckState(Qt::Unchecked);
    QTRY_COMPARE(shownAt(west), paper);
    layer("halves.tif")->setCheckState(Qt::Checked);
    QTRY_VERIFY(shownAt(west).lightness() < 10);
    canvas().setLayer(MapLayer::terrain, true);
    QVERIFY(shownAt(west).lightness() > 10);
    panel.layers().setCurrentItem(layer("halves.tif"));
    press("Up");
    QCOMPARE(panel.layers().row(layer("halves.tif")), panel.layers().count() - 2);
    QVERIFY(shownAt(west).lightness() < 10);
    press("Down");
    QVERIFY(shownAt(west).lightness() > 10);
    press("Up");
    // It follows the map, and is exported with it.
    canvas().zoom(2);
    QVERIFY(shownAt(canvas().frame().toScreen(area(1).grid.at(area(1).nx * 0.4, 60))).lightness() < 10);
    QCOMPARE(exported("with.png"), QString());
    const QPoint at = canvas().frame().toScreen(area(1).grid.at(area(1).nx * 0.4, 60)).toPoint();
    QVERIFY(QImage(file("with.png")).pixelColor(at * 2).lightness() < 10);
    press("Remove");
    QVERIFY(layer("halves.tif") == nullptr);
    QVERIFY(canvas().backgrounds().all().empty());
    QVERIFY(undoName().isEmpty());
  }

  void aRasterOfAnotherProjectionIsBroughtToTheMap() {
    const QString source = halves("halves.tif", true);
    QCOMPARE(QProcess::execute("gdalwarp", {"-q", "-overwrite", "-t_srs", "EPSG:4326", "-ts", "400", "400",
                                            source, file("far.tif")}),
             0);
    window_->map().panel().addBackground(file("far.tif"));
    canvas().setLayer(MapLayer::terrain, false);
    canvas().setLayer(MapLayer::gridLines, false);
    const double middle = (area(1).nx - 1) / 2.0;
    QVERIFY(shownAt(screenOf(1, middle - 6, 20)).lightness() < 10);
    QVERIFY(shownAt(screenOf(1, middle + 6, 20)).lightness() > 245);
    QVERIFY(shownAt(screenOf(1, middle - 6, 90)).lightness() < 10);
    QVERIFY(shownAt(screenOf(1, middle + 6, 90)).lightness() > 245);
  }

  void linesAreABackgroundAboveTheTerrain() {
    const auto from = *canvas().editor()->geographic(area(1).grid.at(5, 50));
    const auto to = *canvas().editor()->geographic(area(1).grid.at(area(1).nx - 5, 50));
    write(file("line.geojson"), QString(R"({"type":"FeatureCollection","features":[
{"type":"Feature","properties":{},"geometry":{"type":"LineString","coordinates":[[%1,%2],[%3,%4]]}},
{"type":"Feature","properties":{},"geometry":{"type":"MultiPoint","coordinates":[[%1,%2]]}},
{"type":"Feature","properties":{},"geometry":null}]})")
                                    .arg(from[0], 0, 'f', 9)
                                    .arg(from[1], 0, 'f', 9)
                                    .arg(to[0], 0, 'f', 9)
                                    .arg(to[1], 0, 'f', 9)
                                    .toUtf8());
    LayerPanel& panel = window_->map().panel();
    panel.addBackground(file("line.geojson"));
    settle();
    QCOMPARE(canvas().backgrounds().below(), std::size_t{0});
    QVERIFY(panel.layers().row(layer("line.geojson")) < panel.layers().row(layer("Terrain")));
    canvas().backgrounds().setColour(canvas().backgrounds().all()[0].id, QColor(255, 0, 255));
    const QPoint middle = ((screenOf(1, 5, 50) + screenOf(1, area(1).nx - 5, 50)) / 2).toPoint();
    int pink = 0;
    for (int y = -2; y <= 2; ++y) {
      const QColor colour = shownAt(middle + QPoint(0, y));
      pink += colour.red() > 150 && colour.blue() > 150 && colour.green() < 120 ? 1 : 0;
    }
    QVERIFY(pink > 0);
  }

  void whatIsWrongWithABackgroundIsTold() {
    LayerPanel& panel = window_->map().panel();
    write(file("none.tif"), "no raster");
    for (const QString& path : {file("none.tif"), file("gone.shp"), halves("loose.tif", false)})
      panel.addBackground(path);
    settle();
    QCoreApplication::processEvents();
    QVERIFY(layer("none.tif")->toolTip().contains("cannot show"));
    QVERIFY(layer("gone.shp")->toolTip().contains("gone.shp"));
    const QString loose = layer("loose.tif")->toolTip();
    QVERIFY2(loose.contains("names no projection"), qPrintable(loose));
    canvas().setLayer(MapLayer::terrain, false);
    QVERIFY(shownAt(screenOf(1, 10, 80)).lightness() < 10);
    QVERIFY(QFile::remove(file("loose.tif")));
  }

  void filesOfNetcdfAreReadFromCopies() {
    // Two at once, one of which has a second variable, the other way round.
    const QString one = netcdf("one.nc", {"-co", "FORMAT=NC4"});
    runTool(
        {"gdal_translate", "-q", "-scale", "0", "100", "100", "0", file("halves.tif"), file("turned.tif")});
    runTool({"gdalbuildvrt", "-q", "-separate", file("both.vrt"), file("halves.tif"), file("turned.tif")});
    runTool({"gdal_translate", "-q", "-of", "netCDF", file("both.vrt"), file("both.nc")});
    write(file("broken.nc"), QByteArray("CDF\x01").append(60, '\x7f'));
    LayerPanel& panel = window_->map().panel();
    panel.show();
    showBackgroundsAlone();
    QCoreApplication::processEvents();
    const QPointF west = screenOf(1, 10, 80);
    const QPointF east = screenOf(1, area(1).nx - 10, 80);
    QSignalSpy reading(&canvas().backgrounds(), &MapBackgrounds::reading);
    panel.addBackground(one);
    panel.addBackground(file("both.nc"));
    panel.addBackground(file("broken.nc"));
    QVERIFY2(shownAt(west).lightness() < 10, qPrintable(shownAt(west).name()));
    QVERIFY(shownAt(east).lightness() > 245);
    QVERIFY(reading.count() >= 3);
    QVERIFY(!window_->map().readingStrip().isVisible());
    QVERIFY2(layer("broken.nc")->toolTip().contains("cannot show"),
             qPrintable(layer("broken.nc")->toolTip()));
    for (const char* name : {"one.nc", "both.nc"}) QVERIFY(!layer(name)->text().contains("(!)"));
    // Only the file of several lets one choose.
    panel.layers().setCurrentItem(layer("one.nc"));
    QVERIFY(!panel.rasters().isVisible());
    panel.layers().setCurrentItem(layer("both.nc"));
    QVERIFY(panel.rasters().isVisible());
    QCOMPARE(panel.rasters().currentText(), QString("Band1"));
    QCOMPARE(panel.rasters().count(), 2);
    panel.rasters().setCurrentText("Band2");
    QVERIFY2(shownAt(west).lightness() > 245, qPrintable(shownAt(west).name()));
    QVERIFY(shownAt(east).lightness() < 10);
    // All of that after a restart.
    window_->close();
    window_ = std::make_unique<MainWindow>(libraries());
    window_->show();
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    QCoreApplication::processEvents();
    showBackgroundsAlone();
    QCOMPARE(canvas().backgrounds().all()[1].raster, QString("Band2"));
    QVERIFY2(shownAt(screenOf(1, 10, 80)).lightness() > 245, qPrintable(shownAt(screenOf(1, 10, 80)).name()));
  }

  void netcdfHasPlacesOfEachPointAndFeaturesToo() {
    // A grid that leans over, with its longitudes and latitudes, which have no place of their own.
    constexpr int kColumns = 8;
    constexpr int kRows = 6;
    QStringList east;
    QStringList north;
    QStringList depths;
    for (int k = 0; k < kRows; ++k) {
      for (int j = 0; j < kColumns; ++j) {
        const auto at = *canvas().editor()->geographic(area(1).grid.at(
            (area(1).nx - 1) * (j + 0.02 * k) / kColumns, (area(1).ny - 1) * k / (kRows - 1.0)));
        east << QString::number(at[0], 'f', 9);
        north << QString::number(at[1], 'f', 9);
        depths << (j < kColumns / 2 ? "0" : "100");
      }
    }
    write(file("leaning.cdl"), QString(R"(netcdf leaning { dimensions: y = %1; x = %2; variables:
double lat(y,x); lat:units = "degrees_north"; double lon(y,x); lon:units = "degrees_east";
float depth(y,x); depth:coordinates = "lon lat"; float code(y,x); data: lat = %3; lon = %4; depth = %5; })")
                                   .arg(kRows)
                                   .arg(kColumns)
                                   .arg(north.join(','), east.join(','), depths.join(','))
                                   .toUtf8());
    runTool({"ncgen", "-o", file("leaning.nc"), file("leaning.cdl")});
    const auto place = *canvas().editor()->geographic(area(1).grid.at(30, 40));
    write(file("place.geojson"),
          QString(R"({"type":"FeatureCollection","features":[{"type":"Feature","properties":{"a":1},
"geometry":{"type":"Point","coordinates":[%1,%2]}}]})")
              .arg(place[0], 0, 'f', 9)
              .arg(place[1], 0, 'f', 9)
              .toUtf8());
    runTool({"ogr2ogr", "-f", "netCDF", "-dsco", "GEOMETRY_ENCODING=WKT", file("place.nc"),
             file("place.geojson")});
    showBackgroundsAlone();
    window_->map().panel().addBackground(file("leaning.nc"));
    settle();
    QVERIFY2(layer("leaning.nc")->toolTip() == file("leaning.nc"),
             qPrintable(layer("leaning.nc")->toolTip()));
    // Of the four variables the one that has a place.
    QCOMPARE(canvas().backgrounds().all()[0].rasters, QStringList({"lat", "lon", "depth", "code"}));
    QCOMPARE(canvas().backgrounds().all()[0].raster, QString("depth"));
    const QColor west = shownAt(screenOf(1, area(1).nx * 0.2, 80));
    QVERIFY2(west.lightness() < 10, qPrintable(west.name()));
    QVERIFY(shownAt(screenOf(1, area(1).nx * 0.7, 80)).lightness() > 245);
    window_->map().panel().addBackground(file("place.nc"));
    settle();
    QVERIFY2(!layer("place.nc")->text().contains("(!)"), qPrintable(layer("place.nc")->toolTip()));
    const MapBackground& points = canvas().backgrounds().all()[1];
    QVERIFY(!points.picture->isRaster);
    QCOMPARE(shownAt(screenOf(1, 30, 40)), points.colour);
  }

  void aMapOfOurOwnIsABackground() {
    showBackgroundsAlone();
    const QPointF land = screenOf(1, 5, 5);
    const QColor paper = shownAt(land);
    window_->map().panel().addBackground(file("estuary.tsb2"));
    settle();
    QVERIFY2(layer("estuary.tsb2")->toolTip() == file("estuary.tsb2"),
             qPrintable(layer("estuary.tsb2")->toolTip()));
    Result<TsbFile> grid = TsbFile::open(area(1).file);
    std::vector<float> row(static_cast<std::size_t>(area(1).nx));
    int shownPoints = 0;
    for (const int k : {5, 40, 80}) {
      QVERIFY(static_cast<bool>(grid->readRows(1, 0, static_cast<std::size_t>(k), row)));
      for (const int j : {5, 20, 60}) {
        const bool isLand = row[static_cast<std::size_t>(j)] >= area(1).landValue;
        QCOMPARE(shownAt(screenOf(1, j, k)) == paper, isLand);
        shownPoints += isLand ? 0 : 1;
      }
    }
    QVERIFY(shownPoints > 0);
  }

  void aLargeFileOfNetcdfIsReadWhereTheMapIs() {
    const QString large = netcdf("large.nc", {"-ot", "Byte", "-outsize", "5000", "5000"});
    showBackgroundsAlone();
    QSignalSpy reading(&canvas().backgrounds(), &MapBackgrounds::reading);
    // Stopped as soon as it begins.
    const auto stop = connect(&canvas().backgrounds(), &MapBackgrounds::reading, this, [this] {
      QTimer::singleShot(0, &window_->map().readingStrip().cancel(), &QToolButton::click);
    });
    window_->map().panel().addBackground(large);
    QTRY_VERIFY(!canvas().backgrounds().all()[0].isShown);
    disconnect(stop);
    settle();
    QVERIFY(!canvas().backgrounds().all()[0].picture.has_value());
    QVERIFY(!window_->map().readingStrip().isVisible());
    layer("large.nc")->setCheckState(Qt::Checked);
    QTRY_VERIFY(canvas().backgrounds().all()[0].picture.has_value());
    const double middle = (area(1).nx - 1) / 2.0;
    QVERIFY(shownAt(screenOf(1, middle - 3, 80)).lightness() < 10);
    const int bright = shownAt(screenOf(1, middle + 3, 80)).lightness();
    QVERIFY2(bright > 90, qPrintable(QString::number(bright)));
    // Near by it is read anew, once, in all its points.
    reading.clear();
    canvas().setFrame({area(1).grid.at(middle, 80), area(1).dx / 100, {}});
    const QPointF centre(canvas().width() / 2.0, canvas().height() / 2.0);
    QVERIFY(shownAt(centre - QPointF(8, 0)).lightness() < 10);
    QVERIFY(shownAt(centre + QPointF(8, 0)).lightness() > 90);
    QVERIFY(!reading.isEmpty());
    reading.clear();
    canvas().zoom(2);
    settle();
    QVERIFY(reading.isEmpty());
    QFile::remove(large);
  }

  void whatWasChosenIsKeptForEachSetup() {
    window_->map().panel().addBackground(halves("halves.tif", true));
    canvas().backgrounds().setOpacity(canvas().backgrounds().all()[0].id, 0.25);
    settle();
    layer("Dikes")->setCheckState(Qt::Unchecked);
    window_->map().panel().colours().setCurrentIndex(2);
    for (QCheckBox* check : {&window_->map().panel().zeroLine(), &window_->map().panel().hillShade(),
                             &window_->map().panel().land(), &window_->map().panel().automatic()})
      check->setChecked(false);
    window_->map().panel().least().setValue(-7);
    const TerrainStyle style = canvas().terrainStyle();
    QVERIFY(style.scale->steepest != TerrainScale{}.steepest);
    canvas().setFrame({area(2).grid.at(3, 4), 7, {}});
    window_->close();
    window_ = std::make_unique<MainWindow>(libraries());
    window_->show();
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    QCoreApplication::processEvents();
    QVERIFY(window_->map().isVisible());
    QCOMPARE(canvas().backgrounds().all().size(), std::size_t{1});
    QCOMPARE(canvas().backgrounds().all()[0].opacity, 0.25);
    QVERIFY(!canvas().drawing().layers.test(placeOf(MapLayer::dikes)));
    QCOMPARE(style.scale->least, -7.0F);
    QVERIFY(!style.zeroLine && !style.hillShade && !style.land);
    QVERIFY(canvas().terrainStyle() == style);
    QCOMPARE(canvas().frame().metresPerPixel, 7.0);
    // Another setup begins with the colours, and with no backgrounds.
    run("v27setup", {"new", "t.v27", "--force", "--area", "inlet.tsb2"});
    QVERIFY(window_->openDocument(file("t.v27")) != nullptr);
    QVERIFY(canvas().backgrounds().all().empty());
    QCOMPARE(canvas().terrainStyle().colours, TerrainColours::grey);
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    QCOMPARE(canvas().backgrounds().all().size(), std::size_t{1});
  }

  void aPackedGridIsShownAsItIs() {
    const QImage before = canvas().grab().toImage();
    QCOMPARE(QProcess::execute("nccopy", {"-d", "5", "-s", file("inlet.tsb2"), file("packed.tsb2")}), 0);
    run("v27setup", {"new", "p.v27", "--force", "--area", "estuary.tsb2", "--area", "packed.tsb2@36,33"});
    QVERIFY(window_->openDocument(file("p.v27")) != nullptr);
    QCoreApplication::processEvents();
    QCOMPARE(canvas().terrain().size(), std::size_t{2});
    settle();
    QVERIFY(canvas().terrain()[1].values->opened() != nullptr);
    const QPoint at = screenOf(2, 30, 30).toPoint();
    QCOMPARE(canvas().grab().toImage().pixelColor(at), before.pixelColor(at));
    QVERIFY(canvas().textAt(area(2).grid.at(30, 30)).contains(" m"));
  }

  // For the eye, where a folder is named: a picture and depth lines as backgrounds.
  void pictures() {
    const QString folder = qEnvironmentVariable("GRIDBAY_PICTURES");
    if (folder.isEmpty()) QSKIP("no folder is named");
    write(file("colours.txt"), "-12 70 110 140\n-4 120 160 165\n0 205 200 160\n4 130 150 90\n12 95 120 70\n");
    for (const QStringList& command :
         {QStringList{"gdal_translate", "-q", "-a_srs", "EPSG:32632", file("estuary.asc"),
                      file("heights.tif")},
          {"gdaldem", "color-relief", "-q", file("heights.tif"), file("colours.txt"), file("chart.tif")},
          {"gdal_contour", "-q", "-i", "2", file("heights.tif"), file("depths.geojson")}})
      QCOMPARE(QProcess::execute(command.front(), command.mid(1)), 0);
    for (const QString name : {"chart.tif", "depths.geojson"})
      window_->map().panel().addBackground(file(name));
    tab().goToPage(kAreas);
    settle();
    MapBackgrounds& backgrounds = canvas().backgrounds();
    const int chart = backgrounds.all()[0].id;
    backgrounds.move(chart, true);
    backgrounds.setOpacity(chart, 0.6);
    for (QAction* action : window_->map().tools().actions()) {
      if (action->text() == "Layers") action->setChecked(true);
    }
    QCoreApplication::processEvents();
    settle();
    QVERIFY(window_->grab().save(folder + "/map-backgrounds.png"));
  }

  void areasWithoutAPlaceAreTold() {
    run("v27setup", {"new", "w.v27", "--force", "--area", "estuary.tsb2", "--area", "inlet.tsb2@36,33"});
    QVERIFY(window_->openDocument(file("w.v27")) != nullptr);
    tab().goToPage(kAreas);
    const QImage before = canvas().grab().toImage();
    QVERIFY(cells().setData(cells().index(1, 0), "gone.tsb2", Qt::EditRole));
    QCoreApplication::processEvents();
    QVERIFY(!area(2).isPlaced);
    QVERIFY2(layer("Areas")->text().contains("1 without a place"), qPrintable(layer("Areas")->text()));
    QVERIFY(layer("Areas")->toolTip().contains("Area 2: "));
    // On the map itself too.
    const QRect corner(10, 8, 100, 10);
    settle();
    QVERIFY(canvas().grab(corner).toImage() != before.copy(corner));
    tab().undo();
  }

  void outputsOfTheModuleArePlacedAndRemoved() {
    QVERIFY(!window_->map().toolAction(MapTool::moduleOutputArea)->isEnabled());
    chooseModule("Hydrodynamic and Advection-Dispersion");
    constexpr int kModuleOutputs = 23;
    constexpr int kDischarges = 20;
    const auto find = [this](MapKind kind, int page) -> const MapFeature* {
      const MapFeature* last = nullptr;
      for (const MapFeature& each : canvas().scene().features) {
        if (each.id.kind == kind && each.id.page == page) last = &each;
      }
      return last;
    };
    const auto count = [this](int page) {
      return std::ranges::count(canvas().scene().features, page,
                                [](const MapFeature& each) { return each.id.page; });
    };
    const auto before = count(kModuleOutputs);
    window_->map().toolAction(MapTool::moduleOutputArea)->trigger();
    drag(screenOf(1, 5, 5), screenOf(1, 25, 15));
    QCOMPARE(count(kModuleOutputs), before + 1);
    QCOMPARE(tab().currentPage(), kModuleOutputs);
    const MapFeature* made = find(MapKind::outputMap, kModuleOutputs);
    QCOMPARE(tab().currentRow(), made->row);
    QVERIFY(canvas().drawing().selection.feature == made->id);
    // Removed right away, with the tool in hand.
    canvas().setFocus();
    QTest::keyClick(&canvas(), Qt::Key_Delete);
    QCOMPARE(count(kModuleOutputs), before);
    window_->map().toolAction(MapTool::moduleOutputPoint)->trigger();
    click(screenOf(1, 12, 30));
    window_->map().toolAction(MapTool::moduleOutputLine)->trigger();
    click(screenOf(1, 5, 20));
    click(screenOf(1, 25, 20));
    QCOMPARE(count(kModuleOutputs), before + 2);
    const auto lines = count(kDischarges);
    window_->map().toolAction(MapTool::discharge)->trigger();
    click(screenOf(1, 5, 25));
    click(screenOf(1, 25, 35));
    QCOMPARE(count(kDischarges), lines + 1);
    QCOMPARE(tab().currentPage(), kDischarges);
    window_->map().toolAction(MapTool::box)->trigger();
    drag(screenOf(1, 5, 40), screenOf(1, 20, 50));
    QVERIFY(find(MapKind::box, 10) != nullptr);
    QCOMPARE(undoName(), QString("New box"));
  }

  void columnsAndFurtherPagesTellOfWhatIsPlaced() {
    chooseModule("Hydrodynamic and Advection-Dispersion");
    const auto addPolygon = [this](double j) {
      return canvas().editor()->addFeature(
          MapKind::massBudget,
          {area(1).grid.at(j, 5), area(1).grid.at(j + 8, 5), area(1).grid.at(j + 8, 15)});
    };
    const std::string fault = addPolygon(5);
    QVERIFY2(fault.empty(), fault.c_str());
    QVERIFY(addPolygon(15).empty());
    for (const double j : {8.0, 14.0})
      QVERIFY(canvas().editor()->addFeature(MapKind::source, {area(1).grid.at(j, 30)}).empty());
    canvas().refresh();
    // A column of the polygons' page, and the other way round.
    QVERIFY(tab().goToPage(kMassBudgets));
    tab().pane().goTo({.entries = {{1}}, .column = 2});
    QVERIFY(canvas().drawing().selection.feature.has_value());
    QCOMPARE(canvas().drawing().selection.feature->number, 2);
    tab().pane().goTo({.entries = {{1}}, .column = 1});
    QCOMPARE(canvas().drawing().selection.feature->number, 1);
    click(screenOf(1, 19, 5));
    QCOMPARE(tab().pane().currentCell().column, 2);
    // A corner, which is told without brackets, is picked on the map.
    tab().pane().goTo({.entries = {{3}}, .column = 2});
    QVERIFY(tab().pane().pointCell().has_value());
    window_->map().startPick();
    click(screenOf(1, 16, 7));
    QCOMPARE(cell(3, 2), QString("16,7"));
    tab().undo();
    // A count is no point.
    tab().pane().goTo({.entries = {{2}}, .column = 2});
    QVERIFY(!tab().pane().pointCell().has_value());
    // Pages that say more of sources, here those of the flow and of the module.
    for (const int page : {41, 24}) {
      QVERIFY(tab().goToPage(page));
      tab().pane().goTo({.entries = {{2, 2}}});
      QVERIFY(canvas().drawing().selection.feature.has_value());
      QCOMPARE(canvas().drawing().selection.feature->kind, MapKind::source);
      QCOMPARE(canvas().drawing().selection.feature->number, 2);
      click(screenOf(1, 8, 30));
      QCOMPARE(tab().currentPage(), page);
      QCOMPARE(tab().pane().currentCell().row, 1);
      QCOMPARE(canvas().drawing().selection.feature->number, 1);
    }
    // And of boundaries: several rows for each, or a column.
    int boundaries = 0;
    while (feature(MapKind::boundary, boundaries + 1) != nullptr) ++boundaries;
    QVERIFY(boundaries > 0);
    for (const int page : {29, 9}) {
      QVERIFY(tab().goToPage(page));
      tab().pane().goTo({.entries = {{boundaries, boundaries}}});
      QVERIFY(canvas().drawing().selection.feature.has_value());
      QCOMPARE(canvas().drawing().selection.feature->kind, MapKind::boundary);
      QCOMPARE(canvas().drawing().selection.feature->number, boundaries);
    }
  }

  void whatWasJustDrawnIsRemovedByTheKey() {
    window_->map().toolAction(MapTool::source)->trigger();
    click(screenOf(1, 8, 10));
    QVERIFY(feature(MapKind::source) != nullptr);
    canvas().setFocus();
    QTest::keyClick(&canvas(), Qt::Key_Delete);
    QVERIFY(feature(MapKind::source) == nullptr);
    QCOMPARE(canvas().tool(), MapTool::source);
    // While a line is drawn nothing is removed.
    window_->map().toolAction(MapTool::dike)->trigger();
    click(screenOf(1, 20, 60));
    QTest::keyClick(&canvas(), Qt::Key_Delete);
    QVERIFY(canvas().isHolding());
  }

  void allIsDoneByKeysToo() {
    const auto key = [this](int each, Qt::KeyboardModifiers with = {}) {
      QTest::keyClick(&canvas(), static_cast<Qt::Key>(each), with);
      QCoreApplication::processEvents();
    };
    const auto lookAt = [this](int number, double j, double k) {
      canvas().setFrame({area(number).grid.at(j, k), area(1).dx / 10, {}});
    };
    canvas().setFocus();
    QVERIFY(canvas().hasFocus());
    // Each tool has a key of its own, which is told.
    std::set<QString> keys;
    for (int i = 0; i < static_cast<int>(MapTool::pick); ++i) {
      const QAction* action = window_->map().toolAction(static_cast<MapTool>(i));
      QVERIFY(!action->shortcut().isEmpty() && keys.insert(action->shortcut().toString()).second);
      QVERIFY(action->toolTip().contains(action->shortcut().toString(QKeySequence::NativeText)));
    }
    for (auto* button : window_->map().tools().findChildren<QToolButton*>())
      QVERIFY(!button->isVisible() || button->focusPolicy() == Qt::StrongFocus);
    // A source, by the middle of the map.
    lookAt(1, 8, 10);
    key(Qt::Key_Q);
    QCOMPARE(canvas().tool(), MapTool::source);
    key(Qt::Key_Space);
    QVERIFY(feature(MapKind::source) != nullptr);
    QVERIFY(std::abs(feature(MapKind::source)->points->front().east - area(1).grid.at(8, 10).east) < 0.01);
    // It is taken, carried along, and let go.
    key(Qt::Key_S);
    QCOMPARE(canvas().tool(), MapTool::select);
    key(Qt::Key_Space);
    QVERIFY(canvas().isHolding());
    key(Qt::Key_Right);
    key(Qt::Key_Up, Qt::ShiftModifier);
    QVERIFY2(window_->map().readout().text().contains("area 1 (14,10)"),
             qPrintable(window_->map().readout().text()));
    key(Qt::Key_Space);
    QVERIFY(!canvas().isHolding());
    QVERIFY(std::abs(feature(MapKind::source)->points->front().east - area(1).grid.at(14, 10).east) < 0.01);
    // Taken and let go at once it is chosen, and Delete removes it.
    key(Qt::Key_Space);
    key(Qt::Key_Space);
    QVERIFY(!canvas().isHolding());
    QCOMPARE(undoName(), QString("Source 1, point 1"));
    key(Qt::Key_Delete);
    QVERIFY(feature(MapKind::source) == nullptr);
    // A dike of two points, and an output area.
    key(Qt::Key_D);
    key(Qt::Key_Space);
    key(Qt::Key_Right);
    key(Qt::Key_Space);
    key(Qt::Key_Return);
    QCOMPARE(feature(MapKind::dike)->points->size(), std::size_t{2});
    lookAt(1, 8, 10);
    key(Qt::Key_A);
    key(Qt::Key_Space);
    QVERIFY(canvas().isHolding());
    key(Qt::Key_Right);
    key(Qt::Key_Up);
    key(Qt::Key_Space);
    QCOMPARE(tab().currentPage(), kOutputs);
    // The border of an area is chosen, and moved.
    canvas().setFocus();
    key(Qt::Key_S);
    lookAt(2, -0.5, 20);
    const GridPoint before = area(2).origin;
    key(Qt::Key_Space);
    key(Qt::Key_Space);
    QCOMPARE(canvas().drawing().selection.area, 2);
    QCOMPARE(area(2).origin.j, before.j);
    key(Qt::Key_Space);
    key(Qt::Key_Right);
    key(Qt::Key_Space);
    QCOMPARE(area(2).origin.j, before.j + 6);
    // The list of layers, and a layer by Space.
    key(Qt::Key_Y);
    QListWidget& layers = window_->map().panel().layers();
    QVERIFY(layers.isVisible());
    layers.setFocus();
    layers.setCurrentItem(layer("Terrain"));
    QTest::keyClick(&layers, Qt::Key_Space);
    QVERIFY(!canvas().drawing().layers.test(placeOf(MapLayer::terrain)));
  }

  void labelsDoNotCoverEachOther() {
    const auto labelled = [this] {
      QImage picture(canvas().size(), QImage::Format_RGB32);
      picture.fill(Qt::white);
      QPainter painter(&picture);
      MapFrame frame = canvas().frame();
      canvas().drawing().paint(painter, frame);
      painter.end();
      return picture;
    };
    window_->map().toolAction(MapTool::source)->trigger();
    click(screenOf(1, 8, 10));
    window_->map().toolAction(MapTool::select)->trigger();
    click(screenOf(1, 20, 60));
    const QImage one = labelled();
    // Another one on the same place has its number on the other side.
    QVERIFY(canvas().editor()->addFeature(MapKind::source, {area(1).grid.at(8, 10)}).empty());
    canvas().refresh();
    const QImage two = labelled();
    const QPoint place = screenOf(1, 8, 10).toPoint();
    const QRect right(place + QPoint(12, -3), QSize(12, 6));
    const QRect left(place - QPoint(24, 3), QSize(12, 6));
    QVERIFY(one.copy(right) == two.copy(right));
    QVERIFY(one.copy(left) != two.copy(left));
  }

  void longLinesAreFoundAtEveryPoint() {
    std::vector<MapPoint> points;
    for (int i = 0; i < 300; ++i) points.push_back(area(1).grid.at(5 + i * 0.2, i % 2 == 0 ? 40 : 60));
    QVERIFY(canvas().editor()->addFeature(MapKind::dike, points).empty());
    canvas().refresh();
    canvas().setFrame({points[150], 1, {}});
    for (const std::size_t i : {std::size_t{148}, std::size_t{150}, std::size_t{152}}) {
      const MapHit hit = canvas().drawing().hit(canvas().frame(), screenOf(points[i]));
      QVERIFY(hit.feature && hit.feature->kind == MapKind::dike);
      QCOMPARE(*hit.vertex, i);
    }
    // Between two points, where one run of points ends and the next begins.
    for (const std::size_t i : {std::size_t{62}, std::size_t{63}, std::size_t{64}, std::size_t{298}}) {
      const MapPoint middle{(points[i].east + points[i + 1].east) / 2,
                            (points[i].north + points[i + 1].north) / 2};
      canvas().setFrame({middle, 0.05, {}});
      const MapHit hit = canvas().drawing().hit(canvas().frame(), screenOf(middle));
      QVERIFY(hit.segment.has_value() && !hit.vertex);
      QCOMPARE(*hit.segment, i);
    }
  }

  void itHasAHelpPage() {
    canvas().setFocus();
    QTest::keyClick(window_->windowHandle(), Qt::Key_F1);
    QVERIFY(window_->help().isVisible());
    QVERIFY(window_->help().browser().toPlainText().startsWith("The map"));
  }

  void theCutOfAnAreaIsStoppedWhenTheSetupIsClosed() {
    MapEditor* editor = canvas().editor();
    const MapPoint a = area(1).grid.at(2, 2);
    const MapPoint b = area(1).grid.at(30, 30);
    const DocumentTab* closed = &tab();
    QTimer::singleShot(0, qApp, [this] {
      auto* tabs = window_->findChild<QTabWidget*>();
      emit tabs->tabCloseRequested(tabs->currentIndex());
    });
    const std::string fault =
        editor->addNestedArea(a, b, file("estuary.tsb2").toStdString(), file("cut.tsb2").toStdString());
    QVERIFY(closed != window_->currentDocument());
    QVERIFY(fault.find("closed") != std::string::npos);
    QVERIFY(!QFile::exists(file("cut.tsb2")));
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
    const auto grid = std::make_shared<TerrainGrid>(*StoredGrid::find(file("turned.tsb2").toStdString(), 1));
    grid->open({});
    QVERIFY(grid->opened() != nullptr);
    const double c = std::cos(0.5);
    const double s = std::sin(0.5);
    TerrainRequest request;
    request.areas = {{grid, {{100, 100}, {10 * c, -10 * s}, {10 * s, 10 * c}}, 5}};
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
