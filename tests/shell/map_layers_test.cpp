// What is shown of the map and how, and pictures of it.

#include <cmath>

#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "tests/shell/map_test.h"

namespace gridbay::shell {

class MapLayersTest final : public MapTest {
  Q_OBJECT

 private slots:
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

  void anExportIsOfWhatWasShownWhenItWasAskedFor() {
    MapBackgrounds& backgrounds = canvas().backgrounds();
    window_->map().panel().addBackground(halves("halves.tif", true));
    settle();
    const int id = backgrounds.all()[0].id;
    backgrounds.move(id, true);
    backgrounds.setOpacity(id, 0.5);
    canvas().setLayer(MapLayer::advice, false);  // which comes when it comes
    window_->map().toolAction(MapTool::source)->trigger();
    click(screenOf(1, 8, 10));
    settle();
    canvas().selectFeature({});
    QCOMPARE(exported("before.png"), QString());
    QCoreApplication::processEvents();  // the strip of the export is gone, and the map has its room again
    settle();
    QSignalSpy ended(&window_->map(), &MapDock::exported);
    window_->map().exportTo(file("asked.png"));
    QVERIFY(ended.isEmpty());
    for (const MapLayer each : {MapLayer::legend, MapLayer::outlines, MapLayer::sources})
      canvas().setLayer(each, false);
    TerrainStyle style;
    style.colours = TerrainColours::grey;
    canvas().setStyle(style);
    backgrounds.setOpacity(id, 1);
    backgrounds.setShown(id, false);
    tab().undo();
    QCoreApplication::processEvents();
    QVERIFY(feature(MapKind::source) == nullptr);
    QVERIFY(!ended.isEmpty() || ended.wait(30000));
    QCOMPARE(ended[0][1].toString(), QString());
    QVERIFY(QImage(file("asked.png")) == QImage(file("before.png")));
    settle();
    QCOMPARE(exported("after.png"), QString());
    QVERIFY(QImage(file("after.png")) != QImage(file("before.png")));
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
};

[[maybe_unused]] static const bool kMapLayersTest = addMapTest<MapLayersTest>();

}  // namespace gridbay::shell

#include "map_layers_test.moc"
