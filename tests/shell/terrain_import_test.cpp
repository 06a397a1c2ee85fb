// Terrain as a user brings it in: real widgets, real clicks and drags, real files, with no display.

#include <QComboBox>
#include <QDir>
#include <QLabel>
#include <QPushButton>
#include <cmath>

#include "platform/tsb/tsb_file.h"
#include "shell/appearance.h"
#include "shell/grid_view.h"
#include "tests/shell/desktop_fixture.h"
#include "tests/shell/import_checks.h"

namespace gridbay::shell {

class TerrainImportTest : public DesktopFixture {
  Q_OBJECT

 private:
  static constexpr int kAreas = 27;

  TerrainImport& dialog() { return *window_->terrainImport(); }
  template <class Widget>
  Widget& part(const char* name) {
    return *dialog().findChild<Widget*>(name);
  }
  QString text(const char* name) { return part<QLineEdit>(name).text(); }
  QString summary() { return part<QLabel>("summary").text(); }
  double number(const char* name) { return text(name).toDouble(); }
  void settle() { QTRY_VERIFY_WITH_TIMEOUT(dialog().isSettled(), 20000); }
  // Typed over what is there, and looked at.
  void typeIn(const char* name, const QString& text) {
    auto& edit = part<QLineEdit>(name);
    edit.setFocus();
    edit.selectAll();
    QTest::keyClick(&edit, Qt::Key_Delete);
    QTest::keyClicks(&edit, text);
    QTest::keyClick(&edit, Qt::Key_Tab);
    settle();
  }
  // Searched, and the first that is found taken.
  void project(const char* name, const QString& words) {
    auto& search = part<ProjectionSearch>(name);
    search.edit().setFocus();
    search.edit().selectAll();
    QTest::keyClicks(&search.edit(), words);
    QTRY_VERIFY(search.completer().popup()->isVisible());
    QTest::keyClick(search.completer().popup(), Qt::Key_Return);
    QVERIFY2(search.isValid(), qPrintable(search.text()));
    settle();
  }
  void open(const QString& name) {
    QTest::keyClick(window_.get(), Qt::Key_T, Qt::ControlModifier | Qt::ShiftModifier);
    QTRY_VERIFY(dialog().isActiveWindow());
    typeIn("file", file(name));
  }
  void press(const char* name) { QTest::mouseClick(&part<QPushButton>(name), Qt::LeftButton); }
  void import() {
    press("import");
    settle();
  }
  // Mouse events on their way through the dialog.
  void moveTo(QWidget& widget, QPointF at) {
    QTest::mouseMove(dialog().windowHandle(), widget.mapTo(&dialog(), at.toPoint()));
    QCoreApplication::processEvents();
  }
  void drag(QWidget& widget, QPointF from, QPointF to) {
    const auto inDialog = [&](QPointF at) { return widget.mapTo(&dialog(), at.toPoint()); };
    moveTo(widget, from);
    QTest::mousePress(dialog().windowHandle(), Qt::LeftButton, {}, inDialog(from));
    moveTo(widget, (from + to) / 2);
    moveTo(widget, to);
    QTest::mouseRelease(dialog().windowHandle(), Qt::LeftButton, {}, inDialog(to));
    QCoreApplication::processEvents();
  }
  static TsbFile read(const QString& path) {
    Result<TsbFile> opened = TsbFile::open(path.toStdString());
    if (!opened) qFatal("%s", opened.error().c_str());
    return std::move(*opened);
  }
  static std::vector<float> valuesOf(const TsbFile& map) {
    std::vector<float> values(map.definition().pointCount());
    if (!map.read(1, 0, std::span<float>(values))) qFatal("the map can't be read");
    return values;
  }
  QStringList files() const { return QDir(folder_->path()).entryList(QDir::Files | QDir::Hidden); }
  // What the page of areas has for the file of one of them.
  QString areaFile(DocumentTab& tab, int area) {
    tab.goToPage(kAreas);
    GridModel& cells = tab.pane().findChild<GridView*>()->cells();
    return QString::fromStdString(cells.style(cells.index(area - 1, 0)).value);
  }

 private slots:
  void initTestCase() {
    makeFolder();
    QByteArray rows = "ncols 40\nnrows 30\nxllcorner 1000\nyllcorner 2000\ncellsize 10\nNODATA_value -99\n";
    for (int row = 0; row < 30; ++row) {
      for (int column = 0; column < 40; ++column)
        rows += row == 0 && column < 5 ? "-99 " : QByteArray::number(column - 20 + 0.25 * row) + " ";
      rows += "\n";
    }
    write(file("slope.asc"), rows);
  }
  void cleanupTestCase() { folder_.reset(); }
  void init() {
    makeWindow();
    for (const char* made :
         {"slope.tsb2", "points.tsb2", "degrees.tsb2", "estuary_new.tsb2", "one.tsb2", "gone.tsb2"})
      QFile::remove(file(made));
  }
  void cleanup() { window_.reset(); }

  void theWholeWayToTheAreaOfASetup() {
    DocumentTab& setup = *window_->openDocument(file("s.v27"));
    const QString before = areaFile(setup, 1);
    open("slope.asc");
    QCOMPARE(dialog().status().text(), QString());
    QCOMPARE(text("target"), file("slope.tsb2"));
    QCOMPARE(number("land"), 30);  // above all terrain, which ends at 26.25
    QCOMPARE(number("west"), 1000);
    QCOMPARE(number("north"), 2300);
    QVERIFY(summary().startsWith("40 x 30 points, 10 x 10 m apart (390 x 290 m)"));
    QVERIFY(summary().endsWith("1,195 wet, 0 dry, 5 missing"));

    // A rectangle from the middle of one cell to that of another one becomes whole cells.
    TerrainPreview& picture = dialog().preview();
    drag(picture, picture.toScreen({1102, 2052}), picture.toScreen({1298, 2198}));
    QCOMPARE(number("west"), 1100);
    QCOMPARE(number("east"), 1300);
    QCOMPARE(number("south"), 2050);
    QCOMPARE(number("north"), 2200);
    QVERIFY(summary().startsWith("20 x 15 points"));
    QVERIFY(summary().endsWith("300 wet, 0 dry"));

    // The land line is dragged down to 0: what is above is dry, and painted so, at once.
    HeightHistogram& heights = dialog().histogram();
    const QPoint high = picture.toScreen({1285, 2055}).toPoint();
    const QColor wet = picture.grab().toImage().pixelColor(high);
    drag(heights, QPointF(90, heights.toScreen(30)), QPointF(90, heights.toScreen(2)));
    QVERIFY(std::abs(number("land") - 2) < 0.3);
    QVERIFY(picture.grab().toImage().pixelColor(high) != wet);
    typeIn("land", "2");
    // Column c of row r is at c - 20 + r / 4: of columns 10 to 29 and rows 10 to 24.
    int dry = 0;
    for (int row = 10; row < 25; ++row) {
      for (int column = 10; column < 30; ++column) dry += column - 20 + 0.25 * row >= 2 ? 1 : 0;
    }
    QVERIFY(summary().endsWith(QString("%1 wet, %2 dry").arg(300 - dry).arg(dry)));

    project("crs", "wgs utm 32s");
    import();
    QVERIFY2(dialog().status().text().contains("20 x 15 points"), qPrintable(dialog().status().text()));
    const TsbFile map = read(file("slope.tsb2"));
    QCOMPARE(map.definition().axes[0].first, 1105.0);
    QCOMPARE(map.definition().axes[1].first, 2055.0);
    QCOMPARE(map.definition().customBlocks.front().values, (std::vector<float>{0, 0, 0, 2}));
    const std::vector<float> values = valuesOf(map);
    QCOMPARE(values.front(), -10 + 0.25F * 24);
    QCOMPARE(values.back(), 9 + 0.25F * 10);
    QVERIFY(map.definition().geography->projection.find("32732") != std::string::npos ||
            map.definition().geography->projection.find("32S") != std::string::npos);

    // It is put to use as one step.
    QCOMPARE(part<QComboBox>("use").itemText(0), "Area 1 of s.v27");
    QCOMPARE(part<QComboBox>("use").itemText(1), "Area 2 of s.v27");
    answers({QMessageBox::Yes}, [this] { press("act"); });
    QVERIFY(areaFile(setup, 1).endsWith("slope.tsb2"));
    QVERIFY(setup.editor().undoable().has_value());
    setup.undo();
    QCOMPARE(areaFile(setup, 1), before);
    QVERIFY(!setup.editor().undoable().has_value());
  }

  void aNewSetupIsMadeAndChecked() {
    open("estuary.asc");
    project("crs", "32632");
    typeIn("land", "5");
    const QStringList asked = answers({QMessageBox::Yes}, [this] { import(); });
    QCOMPARE(asked, QStringList("\"estuary.tsb2\" is there already. Replace it?"));
    QCOMPARE(part<QComboBox>("use").count(), 2);
    answers({}, [this] { press("act"); });
    DocumentTab& fresh = tab();
    QVERIFY(areaFile(fresh, 1).endsWith("estuary.tsb2"));
    window_->checkAction()->trigger();
    QVERIFY(fresh.check().has_value());
    for (const auto& message : fresh.check()->messages)
      QVERIFY2(message.page != PageId::bathymetry, message.text.c_str());
  }

  void aTargetThatIsThereIsLeftUnlessItIsToGo() {
    write(file("slope.tsb2"), "of old");
    open("slope.asc");
    QCOMPARE(answers({QMessageBox::No}, [this] { import(); }).size(), 1);
    QCOMPARE(textOf(file("slope.tsb2")), "of old");
    QVERIFY(!part<QWidget>("act").isVisible());
    answers({QMessageBox::Yes}, [this] { import(); });
    QCOMPARE(valuesOf(read(file("slope.tsb2"))).size(), 1200U);
  }

  void whatIsStoppedLeavesNothing() {
    open("estuary.asc");
    typeIn("target", file("fine.tsb2"));
    typeIn("spacing", "4");
    const QStringList before = files();
    press("import");
    QVERIFY(dialog().isImporting());
    auto& bar = *dialog().findChild<QProgressBar*>();
    QTRY_VERIFY(bar.value() > 0);
    QVERIFY(!part<QWidget>("file").isEnabled());
    QTest::keyClick(&dialog(), Qt::Key_Escape);
    QVERIFY(!dialog().isImporting());
    QVERIFY(dialog().isVisible());
    QCOMPARE(dialog().status().text(), "The import was stopped; nothing is written.");
    QCOMPARE(files(), before);
    // And so does a dialog that is closed meanwhile.
    press("import");
    QTRY_VERIFY(bar.value() > 0);
    press("close");
    QTRY_VERIFY(window_->terrainImport() == nullptr);
    QCOMPARE(files(), before);
  }

  void whatCannotBeReadOrWrittenIsTold() {
    write(file("broken.tif"), "II*\0 this is no raster");
    open("broken.tif");
    QVERIFY2(dialog().status().text().contains("broken.tif"), qPrintable(dialog().status().text()));
    QVERIFY(!part<QPushButton>("import").isEnabled());
    typeIn("file", file("none.asc"));
    QVERIFY(dialog().status().text().contains("none.asc"));
    write(file("points.xyz"), "1 2 3\n4 5 6\n7 8 deep\n");
    typeIn("file", file("points.xyz"));
    QVERIFY(dialog().status().text().contains("line 3: \"deep\" is no number for z"));

    typeIn("file", file("slope.asc"));
    struct Case {
      const char* field;
      QString typed;
      QString says;
    };
    for (const Case& each : {Case{"target", file("slope.asc"), "slope.asc\" is a file that is read here"},
                             {"target", file("no/slope.tsb2"), "No such file or directory"},
                             {"target", "/proc/slope.tsb2", "/proc/slope.tsb2"},
                             {"target", "", "The map needs the name of a file."},
                             {"land", "", "A bathymetry needs a land value"},
                             {"land", "-1", "The land value is at least 0."},
                             {"land", "high", "\"high\" is no number."},
                             {"west", "5000", "The window goes from west to east"}}) {
      const QString before = text(each.field);
      typeIn(each.field, each.typed);
      answers({QMessageBox::Yes}, [this] { import(); });
      QVERIFY2(dialog().status().text().contains(each.says), qPrintable(dialog().status().text()));
      typeIn(each.field, before);
    }
    auto& type = part<QComboBox>("itemType");
    type.setCurrentText("Nonsense");
    import();
    QVERIFY(dialog().status().text().startsWith("There is no item type \"Nonsense\""));
    QVERIFY(!QFile::exists(file("slope.tsb2")));
    // Other quantities have no land of their own.
    type.setCurrentText("Surface Elevation");
    typeIn("land", "");
    typeIn("missing", "-7");
    import();
    QCOMPARE(valuesOf(read(file("slope.tsb2")))[29 * 40], -7.0F);
  }

  void pointsAreGridded() {
    QByteArray points = "name,Northing,Easting,Z\n";
    for (int i = 0; i < 400; ++i) {
      const double east = 500000 + (i % 20) * 50 + (i * 7 % 13);
      const double north = 6000000 + (i / 20) * 50 + (i * 5 % 11);
      points += QString("p%1,%2,%3,%4\n")
                    .arg(i)
                    .arg(north, 0, 'f', 2)
                    .arg(east, 0, 'f', 2)
                    .arg((east - 500000) / 100 - 3, 0, 'f', 4)
                    .toUtf8();
    }
    write(file("points.xyz"), points);
    open("points.xyz");
    QVERIFY2(dialog().status().text().isEmpty(), qPrintable(dialog().status().text()));
    QCOMPARE(number("spacing"), 20);
    QVERIFY(part<QComboBox>("gridding").isVisible());
    typeIn("spacing", "25");
    import();
    const TsbFile map = read(file("points.tsb2"));
    QCOMPARE(map.definition().axes[0].spacing, 25.0);
    QCOMPARE(std::fmod(map.definition().axes[0].first, 25), 0.0);
    const std::size_t nx = map.definition().axes[0].points;
    const std::vector<float> values = valuesOf(map);
    const std::size_t middle = map.definition().axes[1].points / 2 * nx + nx / 2;
    const double east = map.definition().axes[0].first + static_cast<double>(nx / 2) * 25;
    QVERIFY(std::abs(values[middle] - ((east - 500000) / 100 - 3)) < 1e-3);
  }

  void degreesGetTheirZone() {
    QByteArray rows = "ncols 30\nnrows 20\nxllcorner 151.7\nyllcorner -33\ncellsize 0.001\n";
    for (int i = 0; i < 600; ++i) rows += QByteArray::number(i % 30) + " ";
    write(file("degrees.asc"), rows + "\n");
    write(file("degrees.prj"),
          "GEOGCS[\"GCS_WGS_1984\",DATUM[\"D_WGS_1984\",SPHEROID[\"WGS_1984\",6378137.0,298.257223563]],"
          "PRIMEM[\"Greenwich\",0.0],UNIT[\"Degree\",0.0174532925199433]]\n");
    open("degrees.asc");
    QCOMPARE(part<ProjectionSearch>("reproject").edit().text(), "UTM-56S");
    QVERIFY2(dialog().status().text().isEmpty(), qPrintable(dialog().status().text()));
    QVERIFY(number("spacing") > 95 && number("spacing") < 112);
    QVERIFY(number("north") > 6e6);
    typeIn("spacing", "200");
    import();
    const TsbFile map = read(file("degrees.tsb2"));
    QCOMPARE(map.definition().axes[0].spacing, 200.0);
    QVERIFY(std::abs(map.definition().geography->longitude - 151.7) < 0.01);
    QVERIFY(std::abs(map.definition().geography->latitude + 33) < 0.01);
  }

  void aMapOfOursAtAnotherSpacing() {
    open("estuary.tsb2");
    QCOMPARE(number("land"), 5);
    QCOMPARE(text("target"), file("estuary_new.tsb2"));
    typeIn("spacing", "180");
    import();
    const TsbFile map = read(file("estuary_new.tsb2"));
    QCOMPARE(map.definition().axes[0].spacing, 180.0);
    QCOMPARE(map.definition().customBlocks.front().values[3], 5.0F);
  }

  void keysAndThePointer() {
    open("slope.asc");
    TerrainPreview& picture = dialog().preview();
    moveTo(picture, picture.toScreen({1155, 2105}));
    // Column 15 of row 19 from the north.
    QVERIFY2(part<QLabel>("pointed").text().endsWith(": -0.25"), qPrintable(part<QLabel>("pointed").text()));
    drag(picture, picture.toScreen({1100, 2050}), picture.toScreen({1300, 2200}));
    QTest::mouseClick(&picture, Qt::LeftButton, {}, picture.toScreen({1155, 2105}).toPoint());
    QCOMPARE(number("west"), 1000);
    QCOMPARE(number("east"), 1400);
    const double land = number("land");
    QTest::keyClick(&dialog().histogram(), Qt::Key_Down);
    QVERIFY(number("land") < land);
    QTest::keyClick(&dialog(), Qt::Key_F1);
    QVERIFY(window_->help().browser().toPlainText().startsWith("Import Terrain"));
    // The fields come one after the other, as they stand.
    part<QLineEdit>("spacing").setFocus();
    for (const char* next :
         {"resampling", "west", "east", "south", "north", "whole", "itemType", "land", "missing"}) {
      QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
      QCOMPARE(QApplication::focusWidget()->objectName(), QString(next));
    }
    checkAccelerators(dialog());
  }

  void aFileIsDropped() {
    open("estuary.asc");
    drop(dialog(), {QUrl::fromLocalFile(file("slope.asc"))}, true);
    QTRY_COMPARE(text("file"), file("slope.asc"));
    settle();
    QVERIFY(summary().startsWith("40 x 30 points"));
    for (const QLineEdit* edit : dialog().findChildren<QLineEdit*>()) QVERIFY(!edit->acceptDrops());
  }

  void aSpacingThatIsTakenAwayStaysSo() {
    open("estuary.asc");
    project("crs", "32632");
    project("reproject", "32631");
    const QString suggested = text("spacing");
    QVERIFY(suggested.toDouble() > 0);
    auto& why = part<QLabel>("spacingWanted");
    QVERIFY(!why.isVisible());
    typeIn("spacing", "");
    QCOMPARE(text("spacing"), QString());
    QVERIFY2(why.isVisible() && why.text().startsWith("A spacing is wanted: the projection leads to "),
             qPrintable(why.text()));
    import();
    QCOMPARE(dialog().status().text(), why.text());
    QCOMPARE(dialog().focusWidget()->objectName(), QString("spacing"));
    // Another projection brings one again.
    project("reproject", "3035");
    QVERIFY(number("spacing") > 0 && !why.isVisible());
  }

  void rastersOfAllSorts() {
    const QByteArray place = "\nxllcorner 1000\nyllcorner 2000\ncellsize 10\nNODATA_value -99\n";
    // One point, and nothing but missing values.
    write(file("one.asc"), "ncols 1\nnrows 1" + place + "3\n");
    open("one.asc");
    QVERIFY2(summary().startsWith("1 x 1 points"), qPrintable(summary()));
    import();
    QCOMPARE(valuesOf(read(file("one.tsb2"))), std::vector<float>{3});
    write(file("gone.asc"), "ncols 3\nnrows 2" + place + "-99 -99 -99\n-99 -99 -99\n");
    typeIn("file", file("gone.asc"));
    QVERIFY2(summary().endsWith("0 wet, 0 dry, 6 missing"), qPrintable(summary()));
    import();
    QCOMPARE(valuesOf(read(file("gone.tsb2"))), std::vector<float>(6, 10.0F));
    // A huge map is refused before it is begun, by its size.
    typeIn("file", file("estuary.asc"));
    project("crs", "32632");
    typeIn("target", file("huge.tsb2"));
    const QStringList before = files();
    typeIn("spacing", "0.03");
    if (!dialog().status().text().contains("no room")) QSKIP("the disk has room for it");
    import();
    const QString told = dialog().status().text();
    QVERIFY2(told.contains("GB free"), qPrintable(told));
    typeIn("spacing", "0.0001");
    QVERIFY2(dialog().status().text().contains("points 0.0001 apart would be"),
             qPrintable(dialog().status().text()));
    QVERIFY(!part<QPushButton>("import").isEnabled());
    QCOMPARE(files(), before);
  }

  // For the eye: pictures in light and dark where a folder for them is named.
  void pictures() {
    const QString folder = qEnvironmentVariable("GRIDBAY_PICTURES");
    if (folder.isEmpty()) QSKIP("no folder is named");
    open("estuary.asc");
    // Of no folder in particular.
    QVERIFY(QDir::setCurrent(folder_->path()));
    typeIn("file", "estuary.asc");
    typeIn("land", "2");
    TerrainPreview& picture = dialog().preview();
    const QRectF whole = dialog().form().window();
    drag(picture, picture.toScreen(whole.center() - QPointF(whole.width(), whole.height()) / 4),
         picture.toScreen(whole.center() + QPointF(whole.width(), whole.height()) / 3));
    for (const auto& [look, name] : {std::pair{Appearance::light, "light"}, {Appearance::dark, "dark"}}) {
      setAppearance(look);
      QTest::qWait(50);
      QVERIFY(dialog().grab().save(folder + "/terrain-" + name + ".png"));
    }
    setAppearance(Appearance::desktop);
  }
};

}  // namespace gridbay::shell

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("terrain-import-test");
  gridbay::shell::TerrainImportTest test;
  return QTest::qExec(&test, argc, argv);
}

#include "terrain_import_test.moc"
