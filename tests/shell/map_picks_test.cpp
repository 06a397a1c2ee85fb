// The map beside the pages: rows and cells, what is typed, what is pointed at for them, and advice.

#include <QDialogButtonBox>
#include <QMenu>
#include <QPushButton>
#include <cmath>

#include "tests/shell/map_test.h"

namespace gridbay::shell {

class MapPicksTest final : public MapTest {
  Q_OBJECT

  // Presses the button of a cell as a user does, and is the user of the dialog that comes.
  void pressButton(int row, int column, const std::function<void(QDialog&)>& use) {
    auto* table = tab().pane().findChild<GridView*>();
    const QPoint at = table->visualRect(table->model()->index(row - 1, column - 1)).center();
    bool isUsed = false;
    QTimer::singleShot(0, qApp, [&] {
      auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
      if (dialog == nullptr) return;
      isUsed = QTest::qWaitForWindowActive(dialog) && QTest::qWaitForWindowExposed(dialog);
      QCoreApplication::processEvents();  // the fields have their places
      use(*dialog);
      if (dialog->isVisible()) dialog->reject();
    });
    QTest::mouseClick(table->viewport(), Qt::LeftButton, {}, at);
    QVERIFY(isUsed);
    QCoreApplication::processEvents();
  }
  static QPushButton* pickButton(QDialog& dialog) {
    for (auto* each : dialog.findChildren<QPushButton*>()) {
      if (each->text() == "Pick on the map") return each;
    }
    return nullptr;
  }
  static void accept(QDialog& dialog) {
    QTest::mouseClick(dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok), Qt::LeftButton);
  }
  // The n-th field of a dialog.
  static QLineEdit& field(QDialog& dialog, const QString& label, int n = 1) {
    return *qobject_cast<QLineEdit*>(dialog.findChild<PagePane*>()->widgetOf(label, n));
  }

 private slots:
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

  void aCellIsPickedOnTheMap() {
    tab().goToPlace({.page = PageId::bathymetry, .entries = {{2}}, .column = 3});
    QVERIFY(tab().pane().pointPlace().has_value());
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

  void aDialogGoesAsideForAPickOfItsFields() {
    window_->map().toolAction(MapTool::outputArea)->trigger();
    drag(screenOf(1, 5, 5), screenOf(1, 25, 15));
    tab().goToPlace({.page = PageId::hdResult, .entries = {{1}}, .column = 4});
    QCOMPARE(cell(1, 3), QString("5-25,1"));
    constexpr int kChoose = 6;  // column
    const auto pickPart = [this](QDialog& dialog) {
      QVERIFY(!pickButton(dialog)->isHidden());
      QTest::mouseClick(&field(dialog, "Interval:"), Qt::LeftButton);
      QTest::keyClick(&field(dialog, "Interval:"), Qt::Key_A, Qt::ControlModifier);
      QTest::keyClicks(&field(dialog, "Interval:"), "3");
      QTest::mouseClick(&field(dialog, "First:"), Qt::LeftButton);
      QTest::mouseClick(pickButton(dialog), Qt::LeftButton);
      QVERIFY(!dialog.isVisible());
      QCOMPARE(canvas().tool(), MapTool::pick);
      QVERIFY2(window_->map().hint().text().startsWith("J and K: click on one corner"),
               qPrintable(window_->map().hint().text()));
      // Nothing else can be done meanwhile: neither on the page, nor in the tree, nor by a key of the window.
      const int page = tab().currentPage();
      auto* table = tab().pane().findChild<GridView*>();
      QTest::mouseDClick(window_->windowHandle(), Qt::LeftButton, {},
                         table->viewport()->mapTo(window_.get(), QPoint(20, 40)));
      QTest::mouseClick(window_->windowHandle(), Qt::LeftButton, {},
                        tab().tree().viewport()->mapTo(window_.get(), QPoint(60, 12)));
      QTest::keyClick(window_->windowHandle(), Qt::Key_Z, Qt::ControlModifier);
      window_->close();
      QVERIFY(window_->isVisible());
      QCOMPARE(tab().currentPage(), page);
      QCOMPARE(undoName(), QString("New output"));
      click(screenOf(1, 30, 25));
      QVERIFY(!dialog.isVisible());
      click(screenOf(1, 12, 40));
      QVERIFY(dialog.isVisible());
      QCOMPARE(canvas().tool(), MapTool::select);
      QCOMPARE(field(dialog, "First:").text(), QString("12"));
      QCOMPARE(field(dialog, "Last:").text(), QString("30"));
      QCOMPARE(field(dialog, "First:", 2).text(), QString("25"));
      QCOMPARE(field(dialog, "Last:", 2).text(), QString("40"));
      QCOMPARE(field(dialog, "Interval:").text(), QString("3"));
      QCOMPARE(undoName(), QString("New output"));
    };
    // Cancelled, the dialog drops it with all else.
    pressButton(1, kChoose, pickPart);
    QCOMPARE(cell(1, 3), QString("5-25,1"));
    QCOMPARE(undoName(), QString("New output"));
    // Accepted it is one step.
    pressButton(1, kChoose, [&](QDialog& dialog) {
      pickPart(dialog);
      accept(dialog);
    });
    QCOMPARE(cell(1, 3), QString("12-30,3"));
    QCOMPARE(cell(1, 4), QString("25-40,1"));
    tab().undo();
    QCOMPARE(undoName(), QString("New output"));
    QCOMPARE(cell(1, 3), QString("5-25,1"));
    // Esc brings the dialog back without.
    pressButton(1, kChoose, [this](QDialog& dialog) {
      QTest::keyClick(&dialog, Qt::Key_M, Qt::ControlModifier | Qt::ShiftModifier);
      QTRY_VERIFY(!dialog.isVisible());  // the button is seen to go down first
      click(screenOf(1, 30, 25));
      tab().tree().setFocus();  // keys are the map's from there too
      QTest::keyClick(window_->windowHandle(), Qt::Key_Escape);
      QVERIFY(!dialog.isVisible());  // the first takes the click back
      QTest::keyClick(window_->windowHandle(), Qt::Key_Escape);
      QVERIFY(dialog.isVisible());
      QCOMPARE(field(dialog, "First:").text(), QString("5"));
      accept(dialog);
    });
    QCOMPARE(undoName(), QString("New output"));
    // From here on all is as ever.
    window_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window_.get()));
    QTest::keyClick(window_.get(), Qt::Key_M, Qt::ControlModifier);
    QVERIFY(window_->map().isHidden());
  }

  void aDialogGoesAsideForAPickOfItsCells() {
    window_->map().toolAction(MapTool::weir)->trigger();
    click(screenOf(1, 20, 60));
    click(screenOf(1, 30, 60));
    doubleClick(screenOf(1, 30, 60));
    window_->map().toolAction(MapTool::select)->trigger();
    const std::vector<MapPoint> before = *feature(MapKind::weir)->points;
    QCOMPARE(tab().currentPage(), kWeirs);
    pressButton(2, 2, [this](QDialog& dialog) {
      auto* table = dialog.findChild<GridView*>();
      const QPoint at = table->visualRect(table->model()->index(1, 0)).center();
      QTest::mouseClick(table->viewport(), Qt::LeftButton, {}, at);
      QVERIFY(pickButton(dialog)->isEnabled());
      // By the menu of the cell.
      QTimer::singleShot(100, qApp, [] {
        auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
        if (menu == nullptr) return;
        QTest::keyClick(menu, Qt::Key_Down);
        QTest::keyClick(menu, Qt::Key_Return);
      });
      QContextMenuEvent wanted(QContextMenuEvent::Mouse, at, table->viewport()->mapToGlobal(at));
      QCoreApplication::sendEvent(table->viewport(), &wanted);
      QVERIFY(!dialog.isVisible());
      QVERIFY(window_->map().hint().text().startsWith("Point, row 2"));
      click(screenOf(1, 35, 70));
      QVERIFY(dialog.isVisible());
      accept(dialog);
    });
    const std::vector<MapPoint>& now = *feature(MapKind::weir)->points;
    QCOMPARE(now[0], before[0]);
    const MapPoint wanted = area(1).grid.at(35, 70);
    QVERIFY(std::hypot(now[1].east - wanted.east, now[1].north - wanted.north) <
            2 * canvas().frame().metresPerPixel);
    QCOMPARE(undoName(), QString("Location, row 1"));
  }

  void aDialogWithNoPointsHasNoPick() {
    chooseModule("Hydrodynamic and Advection-Dispersion");
    window_->map().toolAction(MapTool::discharge)->trigger();
    click(screenOf(1, 5, 25));
    click(screenOf(1, 25, 35));
    const int columns = cells().columnCount({});
    pressButton(1, columns, [](QDialog& dialog) { QVERIFY(pickButton(dialog)->isHidden()); });  // its items
    // A place has two picks, each of the fields that are at work.
    pressButton(1, 2, [this](QDialog& dialog) {
      QTest::mouseClick(&field(dialog, "K", 2), Qt::LeftButton);
      QTest::mouseClick(pickButton(dialog), Qt::LeftButton);
      click(screenOf(1, 28, 30));
      QCOMPARE(field(dialog, "J", 2).text() + "," + field(dialog, "K", 2).text(), QString("28,30"));
      QCOMPARE(field(dialog, "J").text() + "," + field(dialog, "K").text(), QString("5,25"));
      accept(dialog);
    });
    QCOMPARE(cell(1, 4), QString("(28,30)"));
  }

  void aCellWithNoPointIsNotPicked() {
    QSignalSpy failed(&window_->map(), &MapDock::failed);
    tab().goToPlace({.page = PageId::bathymetry, .entries = {{1}}, .column = 1});
    window_->map().startPick();
    QCOMPARE(failed.count(), 1);
    QCOMPARE(canvas().tool(), MapTool::select);
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
    QVERIFY(tab().pane().pointPlace().has_value());
    window_->map().startPick();
    click(screenOf(1, 16, 7));
    QCOMPARE(cell(3, 2), QString("16,7"));
    tab().undo();
    // A count is no point.
    tab().pane().goTo({.entries = {{2}}, .column = 2});
    QVERIFY(!tab().pane().pointPlace().has_value());
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
};

[[maybe_unused]] static const bool kMapPicksTest = addMapTest<MapPicksTest>();

}  // namespace gridbay::shell

#include "map_picks_test.moc"
