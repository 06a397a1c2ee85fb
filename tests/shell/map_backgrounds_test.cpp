// Rasters and vector files with the map.

#include <QDirIterator>
#include <QScopeGuard>
#include <atomic>
#include <thread>

#include "platform/no_copy_now.h"
#include "tests/shell/map_test.h"

namespace gridbay::shell {

class MapBackgroundsTest final : public MapTest {
  Q_OBJECT

  // The halves as HDF5, with the places of their corners as radar pictures have them. It has as many rows as
  // its reader wants of one that has a place.
  QString hdf5(const QString& name) {
    constexpr int kPoints = 120;
    QStringList depths;
    for (int i = 0; i < kPoints * kPoints; ++i) depths << (i % kPoints < kPoints / 2 ? "0" : "100");
    const auto low = *canvas().editor()->geographic(area(1).grid.at(-0.5, -0.5));
    const auto high = *canvas().editor()->geographic(area(1).grid.at(area(1).nx - 0.5, area(1).ny - 0.5));
    const auto number = [](double value) { return QString::number(value, 'f', 9); };
    write(file("halves.cdl"),
          QString(R"(netcdf halves { dimensions: y = %1; x = %1; variables: float depth(y,x);
data: depth = %2; group: where { :projdef = "+proj=utm +zone=32 +datum=WGS84"; :LL_lon = %3; :LL_lat = %4;
:UR_lon = %5; :UR_lat = %6; } })")
              .arg(kPoints)
              .arg(depths.join(','), number(low[0]), number(low[1]), number(high[0]), number(high[1]))
              .toUtf8());
    runTool({"ncgen", "-4", "-o", file(name), file("halves.cdl")});
    return file(name);
  }
  QString translated(const QString& name, const QStringList& options) {
    const QString source = halves("halves.tif", true);
    runTool(QStringList{"gdal_translate", "-q"} + options + QStringList{source, file(name)});
    return file(name);
  }
  // The beginning of a file under another name.
  QString cut(const QString& name, const QString& path, double part) {
    QFile whole(path);
    if (!whole.open(QFile::ReadOnly)) qFatal("no file");
    write(file(name), whole.read(static_cast<qint64>(static_cast<double>(whole.size()) * part)));
    return file(name);
  }
  // What is read from a file anew; the temporary folder of this process alone.
  QStringList copiesLeft() {
    QStringList left;
    QDirIterator files(file("tmp"), {"*.tif*", "*.gpkg*"}, QDir::Files, QDirIterator::Subdirectories);
    while (files.hasNext()) left << files.next();
    return left;
  }

 private slots:
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

  void filesOfOtherLibrariesAreBackgrounds_data() {
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("isCopied");
    for (const char* name : {"one.h5", "one.bag", "one.grd", "many.vrt"}) QTest::newRow(name) << name << true;
    QTest::newRow("plain.vrt") << "plain.vrt" << false;
  }

  void filesOfOtherLibrariesAreBackgrounds() {
    QFETCH(QString, name);
    QFETCH(bool, isCopied);
    if (name.endsWith(".h5")) hdf5(name);
    if (name.endsWith(".bag")) translated(name, {"-of", "BAG", "-ot", "Float32"});
    if (name.endsWith(".grd")) translated(name, {"-of", "netCDF"});
    if (name == "plain.vrt") runTool({"gdalbuildvrt", "-q", file(name), halves("halves.tif", true)});
    if (name == "many.vrt") runTool({"gdalbuildvrt", "-q", file(name), netcdf("inside.nc")});
    showBackgroundsAlone();
    QSignalSpy reading(&canvas().backgrounds(), &MapBackgrounds::reading);
    window_->map().panel().addBackground(file(name));
    const QColor west = shownAt(screenOf(1, 10, 80));
    QVERIFY2(!layer(name)->text().contains("(!)"), qPrintable(layer(name)->toolTip()));
    QVERIFY2(west.lightness() < 10, qPrintable(west.name()));
    const QColor east = shownAt(screenOf(1, area(1).nx - 10, 80));
    QVERIFY2(east.lightness() > 245, qPrintable(east.name()));
    QCOMPARE(!reading.isEmpty(), isCopied);
  }

  void damagedFilesOfOtherLibrariesAreTold() {
    translated("whole.bag", {"-of", "BAG", "-ot", "Float32"});
    translated("whole.grd", {"-of", "netCDF", "-co", "FORMAT=NC4"});
    QStringList damaged{cut("half.h5", hdf5("whole.h5"), 0.5), cut("start.h5", file("whole.h5"), 0.001),
                        cut("half.bag", file("whole.bag"), 0.5), cut("half.grd", file("whole.grd"), 0.4)};
    for (const auto& [name, source] : {std::pair{"gone.vrt", "nowhere.tif"}, {"hollow.vrt", "half.bag"}}) {
      write(
          file(name),
          QString(R"(<VRTDataset rasterXSize="4" rasterYSize="4"><GeoTransform>%1,50,0,%2,0,-50</GeoTransform>
<VRTRasterBand dataType="Float32" band="1"><SimpleSource><SourceFilename relativeToVRT="1">%3</SourceFilename>
<SourceBand>1</SourceBand></SimpleSource></VRTRasterBand></VRTDataset>)")
              .arg(area(1).grid.at(5, 5).east, 0, 'f', 3)
              .arg(area(1).grid.at(5, 60).north, 0, 'f', 3)
              .arg(source)
              .toUtf8());
      damaged << file(name);
    }
    damaged << cut("half.vrt", file("gone.vrt"), 0.6);
    write(file("none.gmt"), "# @VGMT1.0 @GLINESTRING\n>\nno numbers\n");
    damaged << file("none.gmt");
    for (const QString& path : damaged) window_->map().panel().addBackground(path);
    settle();
    QCoreApplication::processEvents();
    for (const QString& path : damaged) {
      const QString name = QFileInfo(path).fileName();
      const QString tip = layer(name)->toolTip();
      QVERIFY2(tip.contains("cannot show"), qPrintable(name + ": " + tip));
      QVERIFY2(layer(name)->text().contains("(!)"), qPrintable(layer(name)->text()));
    }
  }

  void linesOfGmtAreABackground() {
    const auto from = *canvas().editor()->geographic(area(1).grid.at(5, 50));
    const auto to = *canvas().editor()->geographic(area(1).grid.at(area(1).nx - 5, 50));
    write(file("line.gmt"), QString("# @VGMT1.0 @GLINESTRING\n# @Je4326\n>\n%1 %2\n%3 %4\n")
                                .arg(from[0], 0, 'f', 9)
                                .arg(from[1], 0, 'f', 9)
                                .arg(to[0], 0, 'f', 9)
                                .arg(to[1], 0, 'f', 9)
                                .toUtf8());
    window_->map().panel().addBackground(file("line.gmt"));
    settle();
    QVERIFY2(!layer("line.gmt")->text().contains("(!)"), qPrintable(layer("line.gmt")->toolTip()));
    QVERIFY(!canvas().backgrounds().all()[0].picture->isRaster);
    QCOMPARE(canvas().backgrounds().below(), std::size_t{0});
  }

  void aBetterPictureThatFailsLeavesTheOneThereIs() {
    qputenv("TMPDIR", file("tmp").toUtf8());
    QDir().mkpath(file("tmp"));
    const QString large = netcdf("large.nc", {"-ot", "Byte", "-outsize", "5000", "5000"});
    showBackgroundsAlone();
    window_->map().panel().addBackground(large);
    QTRY_VERIFY_WITH_TIMEOUT(canvas().backgrounds().all()[0].picture.has_value(), 30000);
    settle();
    QCOMPARE(copiesLeft().size(), 1);
    write(large, "nothing of this kind");
    const double middle = (area(1).nx - 1) / 2.0;
    canvas().setFrame({area(1).grid.at(middle, 80), area(1).dx / 100, {}});
    settle();
    const MapBackground& background = canvas().backgrounds().all()[0];
    QTRY_VERIFY(!background.picture->fault.isEmpty());
    settle();
    QVERIFY2(layer("large.nc")->toolTip().contains("cannot show"), qPrintable(layer("large.nc")->toolTip()));
    const QPointF centre(canvas().width() / 2.0, canvas().height() / 2.0);
    QVERIFY(shownAt(centre - QPointF(200, -200)).lightness() < 10);
    // It is told for as long as the map is looked at, and nothing is left of what has failed.
    canvas().zoom(0.7);
    settle();
    QVERIFY(layer("large.nc")->text().contains("(!)"));
    QVERIFY(shownAt(centre - QPointF(200, -200)).lightness() < 10);
    QCOMPARE(copiesLeft().size(), 1);
    // A file that is whole again is read when it is shown anew.
    netcdf("large.nc", {"-ot", "Byte", "-outsize", "200", "200"});
    layer("large.nc")->setCheckState(Qt::Unchecked);
    QTRY_VERIFY2(copiesLeft().isEmpty(), qPrintable(copiesLeft().join(' ')));
    layer("large.nc")->setCheckState(Qt::Checked);
    QTRY_VERIFY(background.picture->fault.isEmpty());
    settle();
    QVERIFY(!layer("large.nc")->text().contains("(!)"));
    qunsetenv("TMPDIR");
  }

  void rastersDoNotWaitForEachOther() {
    qputenv("TMPDIR", file("tmp").toUtf8());
    QDir().mkpath(file("tmp"));
    const QString large = netcdf("large.nc", {"-ot", "Byte", "-outsize", "5000", "5000"});
    const QString small = netcdf("small.nc");
    BackgroundCopies copies(nullptr);
    QSignalSpy made(&copies, &BackgroundCopies::made);
    QSignalSpy progressed(&copies, &BackgroundCopies::progressed);
    qsizetype madeBefore = -1;  // the second one began
    connect(&copies, &BackgroundCopies::progressed, this, [&](int id, double) {
      if (id == 2 && madeBefore < 0) madeBefore = made.count();
    });
    MapFrame frame = canvas().frame();
    const std::string projection = canvas().scene().projectionText;
    // Another file is read beside the first, and another raster of the first in place of it.
    copies.of({.id = 1, .path = large}, frame, projection);
    QTRY_VERIFY(!progressed.isEmpty());
    copies.of({.id = 2, .path = small}, frame, projection);
    copies.of({.id = 1, .path = large, .raster = "Band1"}, frame, projection);
    QTRY_COMPARE_WITH_TIMEOUT(made.count(), 2, 30000);
    QCOMPARE(madeBefore, 0);
    QVERIFY(copies.isIdle());
    QCOMPARE(copiesLeft().size(), 2);
    // What is given up is gone.
    copies.forget(1);
    copies.of({.id = 3, .path = large}, frame, projection);
    QCOMPARE(copies.stop(), std::vector<int>{3});
    QCOMPARE(copiesLeft().size(), 1);
    // Where the map has nothing of a large raster, little is copied of it.
    frame.centre.east += 1e6;
    copies.of({.id = 4, .path = large}, frame, projection);
    QTRY_COMPARE_WITH_TIMEOUT(made.count(), 3, 30000);
    const QString copy = copies.of({.id = 4, .path = large}, frame, projection);
    QVERIFY2(QFileInfo(copy).size() < 10000, qPrintable(QString::number(QFileInfo(copy).size())));
    copies.forgetAll();
    QCOMPARE(copiesLeft(), QStringList());
    qunsetenv("TMPDIR");
  }

  void theFaultOfOneRasterIsNotThatOfAnother() {
    const BackgroundSource one{.id = 1, .path = netcdf("small.nc"), .raster = "Band1"};
    const BackgroundSource none{.id = 1, .path = file("gone.nc"), .raster = "other"};
    const MapFrame frame = canvas().frame();
    const std::string projection = canvas().scene().projectionText;
    BackgroundCopies copies(nullptr);
    const QSignalSpy made(&copies, &BackgroundCopies::made);
    const QSignalSpy failed(&copies, &BackgroundCopies::failed);
    copies.of(one, frame, projection);
    QTRY_COMPARE(made.count(), 1);
    copies.of(none, frame, projection);
    QTRY_COMPARE(failed.count(), 1);
    QVERIFY(!copies.faultOf(1).isEmpty());
    QVERIFY(!copies.of(one, frame, projection).isEmpty());
    QCOMPARE(copies.faultOf(1), QString());
  }

  void theWindowDoesNotWaitForALibrary() {
    std::atomic<bool> isHeld = false;
    std::atomic<bool> mayEnd = false;
    const std::jthread library([&] {
      const NoCopyNow now;
      isHeld = true;
      while (!mayEnd) std::this_thread::yield();
    });
    const auto end = qScopeGuard([&] { mayEnd = true; });
    while (!isHeld) std::this_thread::yield();
    BackgroundWork work(nullptr);
    std::optional<std::string> told;
    connect(&work, &BackgroundWork::ended, this,
            [&](const std::optional<std::string>& text) { told = text; });
    work.begin([](const WorkApart::Progress&) { return std::string("given up"); });
    work.begin([](const WorkApart::Progress&) { return std::string("done"); });
    QVERIFY(work.isRunning());
    QTest::qWait(100);
    QVERIFY(work.isRunning() && !told);
    mayEnd = true;
    QTRY_VERIFY(told.has_value());
    QCOMPARE(*told, std::string("done"));
    QVERIFY(!work.isRunning());
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
};

[[maybe_unused]] static const bool kMapBackgroundsTest = addMapTest<MapBackgroundsTest>();

}  // namespace gridbay::shell

#include "map_backgrounds_test.moc"
