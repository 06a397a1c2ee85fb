// What is placed and dragged on the map.

#include <cmath>
#include <set>

#include "tests/shell/map_test.h"

namespace gridbay::shell {

class MapGraspsTest final : public MapTest {
  Q_OBJECT

 private slots:
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
};

[[maybe_unused]] static const bool kMapGraspsTest = addMapTest<MapGraspsTest>();

}  // namespace gridbay::shell

#include "map_grasps_test.moc"
