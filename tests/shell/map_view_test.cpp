// What the map shows, and its place in the window.

#include <cmath>

#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "tests/shell/map_test.h"

namespace gridbay::shell {

class MapViewTest final : public MapTest {
  Q_OBJECT

 private slots:
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

  void eachLabelAndEachMarkHasItsRoom() {
    // Where there is room for all, all labels are there, however many.
    MapScene scene;
    constexpr int kRows = 25;
    constexpr int kColumns = 20;
    constexpr double kApart = 80;  // pixels
    for (int i = 0; i < kRows * kColumns; ++i) {
      MapFeature source{.id = {MapKind::source, i + 1, kSources}, .label = "8", .drive = MapDrive::source};
      const MapPoint place{kApart * (i % kColumns + 0.5), kApart * (i / kColumns + 0.5)};
      source.points = std::make_shared<const std::vector<MapPoint>>(1, place);
      scene.features.push_back(source);
    }
    MapDrawing drawing;
    drawing.setScene(scene);
    const QSize size(kColumns * kApart, kRows * kApart);
    const MapFrame frame{{size.width() / 2.0, size.height() / 2.0}, 1, size};
    const auto painted = [&] {
      QImage picture(size, QImage::Format_RGB32);
      picture.fill(Qt::white);
      QPainter painter(&picture);
      drawing.paint(painter, frame);
      return picture;
    };
    const QImage labels = painted();
    // What stands beside a point, to its right.
    const auto besideOf = [&](const QImage& picture, MapPoint point) {
      return picture.copy(QRect(frame.toScreen(point).toPoint() + QPoint(11, -4), QSize(14, 8)));
    };
    const QImage first = besideOf(labels, scene.features.front().points->front());
    QImage none = first;
    none.fill(Qt::white);
    QVERIFY(first != none);
    for (const MapFeature& each : scene.features) QVERIFY(besideOf(labels, each.points->front()) == first);
    // Of many points of an output each keeps a label off itself.
    MapFeature output{.id = {MapKind::outputPoints, 1, kOutputs}, .joined = false};
    std::vector<MapPoint> points;
    for (const MapFeature& each : scene.features) {
      points.push_back(each.points->front());
      points.back().east += 18;
    }
    output.points = std::make_shared<const std::vector<MapPoint>>(points);
    scene.features.push_back(output);
    drawing.setScene(scene);
    const QImage beside = painted();
    const QImage mark = besideOf(beside, scene.features.front().points->front());
    QVERIFY(mark != first);
    for (std::size_t i = 0; i < points.size(); ++i)
      QVERIFY(besideOf(beside, scene.features[i].points->front()) == mark);
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

[[maybe_unused]] static const bool kMapViewTest = addMapTest<MapViewTest>();

}  // namespace gridbay::shell

#include "map_view_test.moc"
