// The way of a new user from measured terrain to a checked model of two nested areas, on the desktop alone:
// with the mouse, and with no point of a grid typed.

#include <QFileDialog>
#include <QMenu>
#include <QToolButton>
#include <cmath>

#include "shell/cell_editors.h"
#include "shell/grid_view.h"
#include "shell/import/series_import.h"
#include "tests/shell/desktop_fixture.h"
#include "tests/shell/real_keys.h"

namespace gridbay::shell {

class NewUserTest final : public DesktopFixture {
  Q_OBJECT

 private:
  static constexpr int kAreas = 27;
  static constexpr int kBoundaries = 28;
  static constexpr int kOutputs = 38;
  static constexpr int kPeriod = 39;
  static constexpr int kSources = 40;
  static constexpr int kFlows = 41;

  // The terrain, in metres of its projection.
  static constexpr double kWest = 382249.79;
  static constexpr double kSouth = 6354265.43;
  static constexpr double kWidth = 321;
  static constexpr double kHeight = 416;

  // Mouse events on their way through a window.
  static void drag(QWidget& widget, QPointF from, QPointF to) {
    QWidget& window = *widget.window();
    const auto at = [&](QPointF place) { return widget.mapTo(&window, place.toPoint()); };
    QTest::mouseMove(window.windowHandle(), at(from));
    QTest::mousePress(window.windowHandle(), Qt::LeftButton, {}, at(from));
    QTest::mouseMove(window.windowHandle(), at((from + to) / 2));
    QTest::mouseMove(window.windowHandle(), at(to));
    QTest::mouseRelease(window.windowHandle(), Qt::LeftButton, {}, at(to));
    QCoreApplication::processEvents();
  }
  static void click(QWidget& widget, QPointF place) {
    QWidget& window = *widget.window();
    const QPoint at = widget.mapTo(&window, place.toPoint());
    QTest::mouseMove(window.windowHandle(), at);
    QTest::mouseClick(window.windowHandle(), Qt::LeftButton, {}, at);
    QCoreApplication::processEvents();
  }
  static QAbstractButton& buttonOf(QWidget& parent, const QString& text) {
    for (auto* button : parent.findChildren<QAbstractButton*>()) {
      if (button->text().remove('&') == text) return *button;
    }
    qFatal("there is no button \"%s\"", qPrintable(text));
  }
  // On this platform the window is not active again once a dialog or a menu has closed.
  void activate() { QApplication::setActiveWindow(window_.get()); }
  void pressInWindow(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
    activate();
    QTest::keyClick(window_.get(), key, modifiers);
  }

  // The map.
  MapCanvas& canvas() { return window_->map().canvas(); }
  const MapArea& area(int number) { return *canvas().scene().area(number); }
  // By the parts of an area's width and height.
  QPointF within(int number, double x, double y) {
    const MapArea& it = area(number);
    return canvas().frame().toScreen(it.grid.at(x * (it.nx - 1), y * (it.ny - 1)));
  }
  int countOf(MapKind kind) {
    return static_cast<int>(std::ranges::count(canvas().scene().features, kind,
                                               [](const MapFeature& each) { return each.id.kind; }));
  }
  // Takes a tool from the menu "Place".
  void place(const QString& tool) {
    QTimer::singleShot(0, qApp, [&tool] {
      auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
      if (menu == nullptr) qFatal("there is no menu");
      for (QAction* action : menu->actions()) {
        if (action->text() == tool)
          QTest::mouseClick(menu, Qt::LeftButton, {}, menu->actionGeometry(action).center());
      }
    });
    QTest::mouseClick(&window_->map().placeButton(), Qt::LeftButton);
    QCoreApplication::processEvents();
    activate();
  }

  // Tables.
  GridView& table() { return *tab().pane().tableAt(1); }
  QModelIndex cell(int row, const QString& header) {
    GridModel& cells = table().cells();
    for (int column = 0; column < cells.columnCount(); ++column) {
      if (cells.headerData(column, Qt::Horizontal, Qt::DisplayRole).toString().trimmed() == header)
        return cells.index(row - 1, column);
    }
    qFatal("there is no column \"%s\"", qPrintable(header));
  }
  QString textOfCell(int row, const QString& header) {
    return QString::fromStdString(table().cells().style(cell(row, header)).value);
  }
  void clickCell(int row, const QString& header) {
    const QModelIndex at = cell(row, header);
    table().scrollTo(at);
    QTest::mouseClick(table().viewport(), Qt::LeftButton, {}, table().visualRect(at).center());
  }
  void typeCell(int row, const QString& header, const QString& text) {
    clickCell(row, header);
    auto* edit = qobject_cast<QLineEdit*>(QApplication::focusWidget());
    QVERIFY2(edit != nullptr, qPrintable(header));
    edit->selectAll();
    QTest::keyClicks(edit, text);
    QTest::keyClick(edit, Qt::Key_Return);
    QTRY_COMPARE(textOfCell(row, header), text);
  }
  void chooseCell(int row, const QString& header, const QString& choice) {
    clickCell(row, header);
    auto* list = table().findChild<QComboBox*>();
    QVERIFY(list != nullptr && list->view()->isVisible());
    const int wanted = list->findText(choice);
    QVERIFY(wanted >= 0);
    for (int step = list->currentIndex(); step < wanted; ++step) QTest::keyClick(list->view(), Qt::Key_Down);
    QTest::keyClick(list->view(), Qt::Key_Return);
    QTRY_COMPARE(textOfCell(row, header), choice);
  }

  TerrainImport& terrain() { return *window_->terrainImport(); }
  template <class Widget>
  Widget& part(const char* name) {
    return *terrain().findChild<Widget*>(name);
  }
  void settle() { QTRY_VERIFY_WITH_TIMEOUT(terrain().isSettled(), 20000); }
  void typeIn(const char* name, const QString& text) {
    auto& edit = part<QLineEdit>(name);
    edit.setFocus();
    edit.selectAll();
    QTest::keyClicks(&edit, text);
    QTest::keyClick(&edit, Qt::Key_Tab);
    settle();
  }

  // The steps of the way.

  void importTerrain() {
    pressInWindow(Qt::Key_T, Qt::ControlModifier | Qt::ShiftModifier);
    QTRY_VERIFY(terrain().isActiveWindow());
    typeIn("file", file("merewether_terrain.asc"));
    // The file does not say in which projection it is.
    auto& search = part<ProjectionSearch>("crs");
    search.edit().setFocus();
    QTest::keyClicks(&search.edit(), "mga zone 56");
    QTRY_VERIFY(search.completer().popup()->isVisible());
    QTest::keyClick(search.completer().popup(), Qt::Key_Return);
    QVERIFY2(search.isValid() && search.text().contains("MGA_Zone_56"), qPrintable(search.text()));
    settle();
    typeIn("spacing", "3");
    TerrainPreview& picture = terrain().preview();
    drag(picture, picture.toScreen({kWest + 8, kSouth + 8}),
         picture.toScreen({kWest + kWidth - 8, kSouth + kHeight - 8}));
    // The hills stay dry.
    HeightHistogram& heights = terrain().histogram();
    drag(heights, {90, heights.toScreen(60)}, {90, heights.toScreen(40)});
    QVERIFY(std::abs(part<QLineEdit>("land").text().toDouble() - 40) < 1);
    const QString summary = part<QLabel>("summary").text();
    QVERIFY2(summary.contains(" points, 3 x 3 m apart") && !summary.contains(", 0 dry"), qPrintable(summary));
    QTest::mouseClick(&part<QPushButton>("import"), Qt::LeftButton);
    settle();
    QVERIFY2(QFile::exists(file("merewether_terrain.tsb2")), qPrintable(terrain().status().text()));
    QTest::mouseClick(&part<QPushButton>("act"), Qt::LeftButton);
    QTest::mouseClick(&part<QPushButton>("close"), Qt::LeftButton);
    QTRY_VERIFY(window_->terrainImport() == nullptr);
    QVERIFY(window_->currentDocument() != nullptr);
    QVERIFY(tab().goToPage(kAreas));
    QVERIFY(textOfCell(1, "Bathymetry").endsWith("merewether_terrain.tsb2"));
  }

  void typeThePeriod() {
    QVERIFY(tab().goToPage(kPeriod));
    enter("Simulation start date:", "2007-06-08 12:00:00");
    enter("Time step interval:", "0.5");
    enter("Last:", "7200");
    const Period period = tab().editor().summary().period;
    QCOMPARE(period[1], DateTime::of({2007, 6, 8, 13, 0, 0}));
  }

  void save() {
    chooseFiles({file("flood.v27")});
    pressInWindow(Qt::Key_S, Qt::ControlModifier);
    QVERIFY(QFile::exists(file("flood.v27")));
  }

  void drawANestedArea() {
    pressInWindow(Qt::Key_M, Qt::ControlModifier);
    QVERIFY(window_->map().isVisible());
    window_->resizeDocks({&window_->map()}, {700}, Qt::Horizontal);
    QCoreApplication::processEvents();
    QTRY_VERIFY(canvas().isSettled());
    place("Nested area");
    QCOMPARE(canvas().tool(), MapTool::nestedArea);
    chooseFiles({file("merewether_terrain.asc"), file("street.tsb2")});
    drag(canvas(), within(1, 0.4, 0.35), within(1, 0.75, 0.7));
    QTRY_VERIFY2(canvas().scene().areas.size() == 2, qPrintable(window_->map().readout().text()));
    QVERIFY2(area(2).fault.empty(), area(2).fault.c_str());
    QVERIFY(std::abs(area(2).dx - 1) < 1e-6);
    QVERIFY(area(2).offBy && *area(2).offBy < 0.01);
  }

  void drawABoundary() {
    QVERIFY(tab().goToPage(kBoundaries));
    auto& given = buttonOf(tab().pane(), "User specified");
    QTest::mouseClick(&given, Qt::LeftButton, {}, {10, given.height() / 2});
    enter("Number of boundaries", "0");
    QTRY_COMPARE(countOf(MapKind::boundary), 0);
    place("Open boundary");
    click(canvas(), within(1, 1, 0.6));
    click(canvas(), within(1, 1, 0.95));
    QCOMPARE(countOf(MapKind::boundary), 1);
    QCOMPARE(tab().currentPage(), static_cast<int>(PageId::hdBoundary));
  }

  void placeASource() {
    place("Source");
    click(canvas(), within(2, 0.3, 0.25));
    QCOMPARE(countOf(MapKind::source), 1);
    QCOMPARE(tab().currentPage(), kSources);
  }

  void importADischarge() {
    QByteArray rows = "Date;Discharge [m3/s];Flow velocity [m/s]\n";
    for (int minute = 0; minute <= 60; minute += 5)
      rows += QDateTime(QDate(2007, 6, 8), QTime(12, 0))
                  .addSecs(minute * 60)
                  .toString("dd.MM.yyyy hh:mm")
                  .toUtf8() +
              ";" + QByteArray::number(18 * std::sin(minute / 60.0 * M_PI), 'f', 2) + ";1.5\n";
    write(file("discharge.csv"), rows);
    pressInWindow(Qt::Key_I, Qt::ControlModifier | Qt::ShiftModifier);
    SeriesImport* dialog = window_->seriesImport();
    QVERIFY(dialog != nullptr && dialog->isVisible());
    chooseFiles({file("discharge.csv")});
    QTest::mouseClick(&buttonOf(*dialog, "Open table..."), Qt::LeftButton);
    QTRY_VERIFY(!dialog->isReading());
    QCOMPARE(dialog->verdict()->text(), QString("13 lines are read."));
    QVERIFY2(dialog->coverage()->text().startsWith("The series covers the simulation period"),
             qPrintable(dialog->coverage()->text()));
    QTest::mouseClick(dialog->importButton(), Qt::LeftButton);
    QTRY_VERIFY(QFile::exists(file("discharge.tsb0")));
    auto* use = dialog->findChild<QComboBox*>("use");
    QTRY_VERIFY2(use->isVisible(), qPrintable(dialog->findChild<QLabel*>("why")->text()));

    // The source, which is constant so far, takes the file.
    window_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window_.get()));
    QVERIFY(tab().goToPage(kFlows));
    dialog->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(dialog));
    QTRY_VERIFY(use->isVisible());
    const int source = use->findText("Source and Sink", Qt::MatchContains);
    QVERIFY2(source >= 0, qPrintable(use->itemText(0)));
    QVERIFY2(use->itemText(source).endsWith("given as \"From file\""), qPrintable(use->itemText(source)));
    use->setCurrentIndex(source);
    QTest::mouseClick(&buttonOf(*dialog, "Use it"), Qt::LeftButton);
    QTRY_VERIFY(textOfCell(1, "File name").endsWith("discharge.tsb0"));
    QCOMPARE(textOfCell(1, "Type"), QString("From file"));
    QTest::mouseClick(&buttonOf(*dialog, "Close"), Qt::LeftButton);
    QTRY_VERIFY(window_->seriesImport() == nullptr);
    window_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window_.get()));
    QCOMPARE(textOfCell(1, "Item Name Magnitude"), QString("Discharge"));
  }

  void drawAnOutput() {
    place("Output area");
    drag(canvas(), within(1, 0.05, 0.05), within(1, 0.95, 0.95));
    QCOMPARE(countOf(MapKind::outputMap), 1);
    QCOMPARE(tab().currentPage(), kOutputs);
    typeCell(1, "Time", "0-7200,120");
    typeCell(1, "Data File", "depths.tsb2");
  }

  void check() {
    pressInWindow(Qt::Key_S, Qt::ControlModifier);
    QVERIFY(!tab().editor().isModified());
    pressInWindow(Qt::Key_F7);
    QVERIFY(tab().isCheckCurrent());
    QStringList messages;
    for (const CMessage& message : tab().check()->messages) messages << QString::fromStdString(message.text);
    QVERIFY2(messages.isEmpty(), qPrintable(messages.join('\n')));
    QCOMPARE(tab().check()->faults, 0U);
    QCOMPARE(window_->messagesDock().note().text(), QString("flood.v27: no faults"));
    // What is on disk is the same, with nothing that is doubtful once all its data files are read.
    QProcess tool;
    tool.start(QCoreApplication::applicationDirPath() + "/v27setup",
               {"validate", "--advice", file("flood.v27")});
    QVERIFY(tool.waitForFinished());
    QCOMPARE(QString::fromUtf8(tool.readAllStandardOutput()), QString("0 faults\nno advice\n"));
    QTRY_COMPARE(window_->messages().topLevelItemCount(), 0);
  }

 private slots:
  void initTestCase() {
    const QString measured = QString(GRIDBAY_SHARED_DATA) + "/merewether_terrain.asc";
    if (!QFile::exists(measured)) QSKIP("the measurements are not here");
    makeEmptyFolder();
    QVERIFY(QFile::copy(measured, file("merewether_terrain.asc")));
  }

  void fromTerrainToACheckedNestedModel() {
    openWindow();
    window_->resize(1500, 900);
    using Step = void (NewUserTest::*)();
    for (const Step step :
         {&NewUserTest::importTerrain, &NewUserTest::typeThePeriod, &NewUserTest::save,
          &NewUserTest::drawANestedArea, &NewUserTest::drawABoundary, &NewUserTest::placeASource,
          &NewUserTest::importADischarge, &NewUserTest::drawAnOutput, &NewUserTest::check}) {
      (this->*step)();
      if (QTest::currentTestFailed()) break;
    }
    if (const QString folder = qEnvironmentVariable("GRIDBAY_PICTURES"); !folder.isEmpty())
      QVERIFY(window_->grab().save(folder + "/new-user.png"));
    window_.reset();
  }
};

}  // namespace gridbay::shell

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("new-user-test");
  gridbay::shell::NewUserTest test;
  return QTest::qExec(&test, argc, argv);
}

#include "new_user_test.moc"
