#pragma once

#include <QFileDialog>
#include <QRadioButton>
#include <QRegularExpression>
#include <QSignalSpy>
#include <algorithm>
#include <functional>
#include <memory>
#include <vector>

#include "shell/grid_view.h"
#include "tests/shell/desktop_fixture.h"

namespace gridbay::shell {

// The map as a user has it: real widgets, real clicks and drags, real files, with no display.
class MapTest : public DesktopFixture {
  Q_OBJECT

 protected:
  static constexpr int kFloodAndDry = 26;
  static constexpr int kAreas = 27;
  static constexpr int kBoundaries = 28;
  static constexpr int kDikes = 31;
  static constexpr int kSources = 40;
  static constexpr int kOutputs = 38;
  static constexpr int kModules = 35;
  static constexpr int kWeirs = 45;
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
};

// The classes of tests of this program; each source adds its own.
using MakeMapTest = std::unique_ptr<QObject> (*)();
inline std::vector<MakeMapTest>& mapTests() {
  static std::vector<MakeMapTest> all;
  return all;
}
template <class Test>
bool addMapTest() {
  mapTests().push_back([]() -> std::unique_ptr<QObject> { return std::make_unique<Test>(); });
  return true;
}

}  // namespace gridbay::shell
