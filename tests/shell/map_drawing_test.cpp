// What the map draws: each thing is there, where it belongs, and changes nothing else.

#include "shell/map/map_drawing.h"

#include <cmath>

#include "tests/shell/map_test.h"

namespace gridbay::shell {

class MapDrawingTest final : public MapTest {
  Q_OBJECT

 private:
  // A map of 60 x 40 points, alike from south to north: flat as far as column 20, a slope from -6 to 3.5 that
  // reaches 0 at column 32, flat from column 40, and land from column 50.
  static constexpr int kColumns = 60;
  static constexpr int kRows = 40;
  static constexpr double kSpacing = 100;
  static constexpr double kZero = 32;
  static constexpr double kFlat = 40;
  static constexpr double kLand = 50;
  static constexpr double kMargin = 14;  // of the scales, in pixels

  // Opens it with its heights times a factor, as terrain alone in plain colours.
  void openSlope(double factor = 1) {
    QStringList row;
    for (int j = 0; j < kColumns; ++j)
      row << QString::number(j >= kLand ? 10 : factor * (-6 + 0.5 * std::clamp(j - 20, 0, 19)), 'f', 4);
    write(file("slope.asc"),
          (QString("ncols %1\nnrows %2\nxllcorner 480000\nyllcorner 6100000\ncellsize %3\n")
               .arg(kColumns)
               .arg(kRows)
               .arg(kSpacing) +
           (row.join(' ') + "\n").repeated(kRows))
              .toUtf8());
    run("v27setup",
        {"convert", "raster", "slope.asc", "slope.tsb2", "--force", "--land", "5", "--crs", "UTM-32"});
    run("v27setup", {"new", "slope.v27", "--force", "--area", "slope.tsb2"});
    QVERIFY(window_->openDocument(file("slope.v27")) != nullptr);
    window_->map().panel().show();
    for (std::size_t i = 0; i < kMapLayers; ++i) canvas().setLayer(static_cast<MapLayer>(i), i == 0);
    for (QCheckBox* check : {&panel().hillShade(), &panel().zeroLine()}) set(*check, false);
    QCoreApplication::processEvents();
    canvas().fit();
  }
  LayerPanel& panel() { return window_->map().panel(); }
  static void set(QCheckBox& check, bool on) {
    if (check.isChecked() != on) QTest::mouseClick(&check, Qt::LeftButton, {}, QPoint(6, check.height() / 2));
    QCOMPARE(check.isChecked(), on);
  }
  QImage picture() {
    settle();
    QCoreApplication::processEvents();
    return canvas().grab().toImage();
  }
  // Of a thing that is switched: the picture without it and with it.
  struct Both {
    QImage without;
    QImage with;
  };
  Both both(QCheckBox& check) {
    set(check, false);
    const QImage without = picture();
    set(check, true);
    return {without, picture()};
  }
  Both both(MapLayer layer) {
    canvas().setLayer(layer, false);
    const QImage without = picture();
    canvas().setLayer(layer, true);
    return {without, picture()};
  }
  static bool differsAt(const Both& both, QPointF at) {
    return both.without.pixel(at.toPoint()) != both.with.pixel(at.toPoint());
  }
  // The pixels that differ.
  static QRegion changed(const Both& both) {
    QRegion region;
    for (int y = 0; y < both.with.height(); ++y) {
      for (int x = 0, first = 0; x < both.with.width(); first = ++x) {
        while (x < both.with.width() && both.with.pixel(x, y) != both.without.pixel(x, y)) ++x;
        if (x > first) region += QRect(first, y, x - first, 1);
      }
    }
    return region;
  }
  // Of columns of the slope, all rows, with a pixel around.
  QRect columns(double first, double last) {
    const QRectF whole(screenOf(1, first, kRows - 0.5), screenOf(1, last, -0.5));
    return whole.toAlignedRect().adjusted(-1, -1, 1, 1);
  }
  static int lightness(const QImage& picture, QPointF at) {
    return picture.pixelColor(at.toPoint()).lightness();
  }

  // Where the scales stand.
  QRect scaleBar() { return {0, canvas().height() - 40, canvas().width() / 4 + 40, 40}; }
  QRect projection() { return {canvas().width() / 2, canvas().height() - 32, canvas().width() / 2, 32}; }
  QRect north() { return {canvas().width() - 60, 0, 60, 68}; }
  QRect colours() { return {canvas().width() - 100, 68, 100, 170}; }
  static bool isBlack(const QImage& picture, QPointF at) { return lightness(picture, at) < 60; }

  static MapScene sceneOf(std::vector<MapFeature> features) {
    MapScene scene;
    scene.features = std::move(features);
    return scene;
  }
  static QImage painted(const MapDrawing& drawing, const MapFrame& frame) {
    QImage image(frame.size.toSize(), QImage::Format_RGB32);
    image.fill(Qt::white);
    QPainter painter(&image);
    drawing.paint(painter, frame);
    return image;
  }

 private slots:
  void hillShadeIsOnSlopesAlone() {
    openSlope();
    const Both shade = both(panel().hillShade());
    const QRegion region = changed(shade);
    QVERIFY(columns(18.5, kFlat + 0.5).contains(region.boundingRect()));
    // The whole slope, which faces west, is in the light.
    for (const auto& [j, k] : {std::pair{24, 5}, {28, 20}, {36, 35}}) {
      const QPointF at = screenOf(1, j, k);
      QVERIFY(differsAt(shade, at));
      QVERIFY(lightness(shade.with, at) > lightness(shade.without, at));
    }
  }

  void theZeroLineIsWhereTheSignChanges() {
    openSlope();
    const Both line = both(panel().zeroLine());
    const QRect found = changed(line).boundingRect();
    QVERIFY(columns(kZero - 0.5, kZero - 0.5).contains(found));
    QVERIFY(found.height() >= columns(0, 0).height() - 4);
    QVERIFY(line.with.pixelColor(found.center()).lightness() < 40);
  }

  void landHasItsColour() {
    openSlope();
    const Both land = both(panel().land());
    QVERIFY(columns(kLand - 0.5, kColumns - 0.5).contains(changed(land).boundingRect()));
    for (const auto& [j, k] : {std::pair{50, 0}, {55, 20}, {59, 39}})
      QCOMPARE(land.with.pixel(screenOf(1, j, k).toPoint()), landColour());
    // Without it the ground is seen, as it is beside the map.
    QCOMPARE(land.without.pixel(screenOf(1, 55, 20).toPoint()), land.without.pixel(2, 2));
  }

  void gridLinesAreAtTheBordersOfCellsOnceTheyAreLarge() {
    openSlope();
    constexpr double kNear = 20;  // pixels for a cell
    canvas().setFrame({area(1).grid.at(30, 20), kSpacing / kNear, {}});
    const Both lines = both(MapLayer::gridLines);
    const QRegion region = changed(lines);
    const auto isLineAt = [&](double j, double k) {
      return region.intersects(QRect(screenOf(1, j, k).toPoint() - QPoint(1, 1), QSize(3, 3)));
    };
    for (const double j : {25.5, 30.5, 34.5}) QVERIFY(isLineAt(j, 20.2));
    for (const double k : {10.5, 20.5, 25.5}) QVERIFY(isLineAt(30.2, k));
    const auto toBorder = [](double at) { return std::abs(at - 0.5 - std::round(at - 0.5)) * kNear; };
    const QRect inside = columns(-0.5, kColumns - 0.5);
    for (const QRect& rect : region) {
      for (int x = rect.left(); x <= rect.right(); ++x) {
        for (int y = rect.top(); y <= rect.bottom(); ++y) {
          const auto [j, k] = area(1).grid.pointOf(canvas().frame().toMap({x + 0.5, y + 0.5}));
          QVERIFY(inside.contains(x, y) && std::min(toBorder(j), toBorder(k)) < 1.5);
        }
      }
    }
    // From further away there are none.
    canvas().setFrame({area(1).grid.at(30, 20), kSpacing / 5, {}});
    QVERIFY(changed(both(MapLayer::gridLines)).isEmpty());
  }

  void theScalesStandInTheirCorners() {
    openSlope();
    const Both legend = both(MapLayer::legend);
    const QRegion all = changed(legend);
    for (const QRect& each : {scaleBar(), projection(), north(), colours()}) QVERIFY(all.intersects(each));
    QVERIFY((all - scaleBar() - projection() - north() - colours()).isEmpty());
  }

  void theScaleBarIsOfItsLength() {
    openSlope();
    canvas().setLayer(MapLayer::legend, true);
    // The round length below a quarter of the width.
    for (const auto& [metres, quarter] : {std::pair{100.0, 130.0}, {200.0, 480.0}, {5000.0, 9500.0}}) {
      const double metresPerPixel = quarter / (canvas().width() / 4.0);
      canvas().setFrame({area(1).grid.at(-10000, 0), metresPerPixel, {}});
      const QImage shown = picture();
      const double part = metres / metresPerPixel / 4;
      const double y = canvas().height() - kMargin;
      for (int i = 0; i < 4; ++i)
        QCOMPARE(isBlack(shown, QPointF(kMargin + (i + 0.5) * part, y)), i % 2 == 0);
      const double end = kMargin + 4 * part;
      QVERIFY(lightness(shown, QPointF(end - 3, y)) > 245);
      QCOMPARE(shown.pixel(QPointF(end + 4, y).toPoint()), shown.pixel(2, 2));
      // Its length is written above.
      const QRect text(static_cast<int>(kMargin + 2 * part) - 20, static_cast<int>(y) - 20, 40, 12);
      bool isWritten = false;
      for (int x = text.left(); x <= text.right(); ++x)
        isWritten = isWritten || isBlack(shown, {1.0 * x, y - 14});
      QVERIFY(isWritten);
    }
  }

  void theArrowPointsNorth() {
    openSlope();
    const Both legend = both(MapLayer::legend);
    const auto width = [&](int y) {
      int black = 0;
      for (int x = north().left(); x <= north().right(); ++x)
        black += isBlack(legend.with, QPointF(x, y)) ? 1 : 0;
      return black;
    };
    const int top = static_cast<int>(kMargin);
    QVERIFY(width(top + 5) > 0);
    QVERIFY(width(top + 18) > 2 * width(top + 5));
    QVERIFY(width(top + 38) > 0);  // its letter
  }

  void theProjectionIsNamed() {
    const MapFrame frame{{}, 10, {600, 500}};
    const auto legend = [&](const std::string& name) {
      MapScene scene;
      scene.projection = name;
      MapDrawing drawing;
      drawing.setScene(scene);
      QImage image(frame.size.toSize(), QImage::Format_RGB32);
      image.fill(Qt::gray);
      QPainter painter(&image);
      drawing.paintLegend(painter, frame, {}, {});
      return image;
    };
    const QRect corner(300, 470, 300, 30);
    for (const char* other : {"UTM-33", "Local Coordinates"}) {
      const QRegion region = changed({legend("UTM-32"), legend(other)});
      QVERIFY(!region.isEmpty());
      QVERIFY(corner.contains(region.boundingRect()));
    }
    // That of the setup, on the map itself.
    openSlope();
    QCOMPARE(QString::fromStdString(canvas().scene().projection), QString("WGS 84 / UTM zone 32N"));
  }

  void shortBoundariesAreNumberedToo() {
    using enum MapDrive;
    const std::array drives{levelConstant, levelSeries, levelFile, fluxConstant, fluxFile, ratingCurve};
    // One after the other along a border, each of 8 pixels, so that their numbers must step aside.
    std::vector<MapFeature> features;
    for (std::size_t i = 0; i < drives.size(); ++i) {
      const double east = 80.0 * static_cast<double>(i);
      const int number = static_cast<int>(i) + 1;
      features.push_back({.id = {.number = number},
                          .label = std::to_string(number),
                          .drive = drives[i],
                          .points = std::make_shared<std::vector<MapPoint>>(
                              std::vector<MapPoint>{{east, 0}, {east + 80, 0}})});
    }
    const auto countOf = [](const QImage& image, const QColor& colour) {
      int count = 0;
      for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) count += image.pixel(x, y) == colour.rgb() ? 1 : 0;
      }
      return count;
    };
    // In the middle of the picture, and at its edge.
    for (const double east : {240.0, 2900.0}) {
      const MapFrame frame{{east, 0}, 10, {600, 500}};
      MapDrawing drawing;
      drawing.setScene(sceneOf(features));
      const QImage numbered = painted(drawing, frame);
      for (const MapFeature& each : features) {
        const QColor colour = featureColour(each);
        drawing.setScene(sceneOf({each}));
        const int alone = countOf(painted(drawing, frame), colour);
        QVERIFY(alone > 90);
        QVERIFY2(countOf(numbered, colour) > 0.7 * alone, qPrintable(QString::number(each.id.number)));
      }
    }
  }

  void coloursHaveLimitsAsFineAsTheTerrain() {
    QCOMPARE(panel().least().decimals(), 2);  // some metres
    openSlope(0.01);
    settle();
    QTRY_COMPARE(panel().least().value(), -0.06);
    QCOMPARE(panel().greatest().value(), 0.035);
    QVERIFY(panel().least().decimals() >= 4);
    set(panel().automatic(), false);
    panel().least().setFocus();
    panel().least().selectAll();
    QTest::keyClicks(&panel().least(), "-0.0125");
    QTest::keyClick(&panel().least(), Qt::Key_Return);
    QCOMPARE(canvas().scale()->least, -0.0125F);
    QCOMPARE(canvas().scale()->greatest, 0.035F);
    // They are kept, and another setup has its own.
    window_->close();
    openWindow();
    QVERIFY(window_->openDocument(file("slope.v27")) != nullptr);
    QCoreApplication::processEvents();
    QCOMPARE(panel().least().value(), -0.0125);
    QCOMPARE(panel().greatest().value(), 0.035);
    QCOMPARE(canvas().scale()->least, -0.0125F);
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    settle();
    QTRY_COMPARE(panel().least().decimals(), 2);
    QVERIFY(panel().least().value() < -5);
  }
};

[[maybe_unused]] static const bool kMapDrawingTest = addMapTest<MapDrawingTest>();

}  // namespace gridbay::shell

#include "map_drawing_test.moc"
