// What is drawn on the map and dragged there, by the mouse, and what is typed in a cell, by keys.

#include "shell/map/map_layers.h"
#include "tests/shell/map_test.h"
#include "tests/shell/real_keys.h"

namespace gridbay::shell {

class MapDragsTest final : public MapTest {
  Q_OBJECT

 private:
  static constexpr int kCulverts = 30;
  static constexpr int kBoxes = 10;
  inline static const QColor kHeld{0xFF, 0xC4, 0x00};

  void take(MapTool tool) { window_->map().toolAction(tool)->trigger(); }
  void pressMapKey(Qt::Key key) {
    canvas().setFocus();
    QTest::keyClick(&canvas(), key);
    QCoreApplication::processEvents();
  }
  void undo() {
    tab().undo();
    QCoreApplication::processEvents();
  }

  // Whether a colour is on the map as it is now, within two pixels of a place.
  bool isSeen(QPointF at, const QColor& colour) {
    const QImage picture = canvas().grab().toImage();
    constexpr int kNear = 2;
    for (int y = -kNear; y <= kNear; ++y) {
      for (int x = -kNear; x <= kNear; ++x) {
        const QColor shown = picture.pixelColor(at.toPoint() + QPoint(x, y));
        const int far = std::abs(shown.red() - colour.red()) + std::abs(shown.green() - colour.green()) +
                        std::abs(shown.blue() - colour.blue());
        if (far < 30) return true;
      }
    }
    return false;
  }
  // The middle of the pixel that a mouse event at a place tells of.
  static QPointF onPixel(QPointF at) { return QPointF(at.toPoint()); }
  static QList<double> numbersOf(const QString& text, const QString& key) {
    const QRegularExpression line("\\n *" + key + " ([^\\n]*)");
    QList<double> numbers;
    for (const QString& each : line.match(text).captured(1).split(' ', Qt::SkipEmptyParts))
      numbers << each.toDouble();
    return numbers;
  }
  bool isLine(QPointF a, QPointF b, MapKind kind) {
    return isSeen(a + (b - a) * 0.3, layerColour(layerOf(kind)));
  }
  // Drags with a look between: before it is let go the map must show where it would come to.
  void dragSeen(QPointF from, QPointF to) { dragSeen(from, to, to); }
  void dragSeen(QPointF from, QPointF to, QPointF place) {
    moveTo(from);
    press(from);
    moveTo((from + to) / 2);
    moveTo(to);
    QVERIFY(canvas().isHolding());
    QVERIFY(isSeen(place, kHeld));
    release(to);
    QCoreApplication::processEvents();
    QVERIFY(!canvas().isHolding());
  }

 private slots:
  void aPolygonIsDrawnAndItsCornerDragged() {
    chooseModule("Hydrodynamic and Advection-Dispersion");
    const std::vector<std::pair<int, int>> corners{{10, 10}, {30, 10}, {30, 30}, {10, 30}};
    take(MapTool::massBudget);
    for (const auto& [j, k] : corners) click(screenOf(1, j, k));
    QVERIFY(canvas().isHolding());
    QVERIFY(isSeen(screenOf(1, 30, 30), kHeld));
    QVERIFY(feature(MapKind::massBudget) == nullptr);
    pressMapKey(Qt::Key_Return);
    QCOMPARE(feature(MapKind::massBudget)->points->size(), corners.size());
    QCOMPARE(undoName(), QString("New polygon"));
    QCOMPARE(tab().currentPage(), kMassBudgets);
    QCOMPARE(cell(1, 1), QString("1"));
    QCOMPARE(cell(5, 1), QString("30,30"));

    take(MapTool::select);
    dragSeen(screenOf(1, 30, 30), screenOf(1, 35, 28));
    QCOMPARE(undoName(), QString("Polygon 1, Corner point 3"));
    QCOMPARE(cell(4, 1), QString("30,10"));
    QCOMPARE(cell(5, 1), QString("35,28"));
    QVERIFY(isLine(screenOf(1, 35, 28), screenOf(1, 10, 30), MapKind::massBudget));
    QVERIFY(isLine(screenOf(1, 30, 10), screenOf(1, 35, 28), MapKind::massBudget));
    undo();
    QCOMPARE(cell(5, 1), QString("30,30"));
    QVERIFY(!isLine(screenOf(1, 30, 10), screenOf(1, 35, 28), MapKind::massBudget));
    QCOMPARE(undoName(), QString("New polygon"));
  }

  void aCulvertIsDrawnAndItsPointDragged() {
    take(MapTool::culvert);
    for (const auto& [j, k] : {std::pair{20, 60}, {30, 60}, {40, 70}}) click(screenOf(1, j, k));
    QVERIFY(feature(MapKind::culvert) == nullptr);
    pressMapKey(Qt::Key_Return);
    QCOMPARE(undoName(), QString("New Culvert"));
    QCOMPARE(tab().currentPage(), kCulverts);
    QVERIFY(isLine(screenOf(1, 20, 60), screenOf(1, 30, 60), MapKind::culvert));

    take(MapTool::select);
    const MapPoint wanted = canvas().frame().toMap(onPixel(screenOf(1, 32, 52)));
    dragSeen(screenOf(1, 30, 60), screenOf(1, 32, 52));
    QCOMPARE(undoName(), QString("Culvert 1, point 2"));
    QVERIFY(isLine(screenOf(1, 20, 60), screenOf(wanted), MapKind::culvert));
    QVERIFY(window_->saveDocument(file("culvert.v27")));
    const QString text = textOf(file("culvert.v27"));
    const QString own = text.mid(text.indexOf("Culvert_data"));
    QCOMPARE(numbersOf(own, "x").size(), 3);
    QVERIFY2(std::abs(numbersOf(own, "x")[1] - wanted.east) < 0.01, qPrintable(own.left(400)));
    QVERIFY(std::abs(numbersOf(own, "y")[1] - wanted.north) < 0.01);
    undo();
    undo();
    QVERIFY(feature(MapKind::culvert) == nullptr);
    QVERIFY(undoName().isEmpty());
  }

  void anOutputAreaIsDraggedByItsCorner() {
    take(MapTool::outputArea);
    drag(screenOf(1, 5, 5), screenOf(1, 25, 15));
    take(MapTool::select);
    dragSeen(screenOf(1, 25, 15), screenOf(1, 30, 22));
    QCOMPARE(undoName(), QString("Output 1, point 3"));
    QCOMPARE(cell(1, 3), QString("5-30,1"));
    QCOMPARE(cell(1, 4), QString("5-22,1"));
    QVERIFY(isLine(screenOf(1, 30, 5), screenOf(1, 30, 22), MapKind::outputMap));
    // Another corner, beyond the opposite side.
    dragSeen(screenOf(1, 5, 5), screenOf(1, 34, 10));
    QCOMPARE(cell(1, 3), QString("30-34,1"));
    QCOMPARE(cell(1, 4), QString("10-22,1"));
    undo();
    undo();
    QCOMPARE(cell(1, 3), QString("5-25,1"));
    QCOMPARE(undoName(), QString("New output"));
  }

  void anOutputLineIsDraggedAlongItsAxis() {
    take(MapTool::outputLine);
    click(screenOf(1, 5, 20));
    click(screenOf(1, 25, 20));
    take(MapTool::select);
    dragSeen(screenOf(1, 25, 20), screenOf(1, 35, 24), screenOf(1, 35, 20));
    QCOMPARE(undoName(), QString("Output 1, point 2"));
    QCOMPARE(cell(1, 3), QString("5-35,1"));
    QCOMPARE(cell(1, 4), QString("20-20,1"));
    QVERIFY(isLine(screenOf(1, 25, 20), screenOf(1, 35, 20), MapKind::outputLine));
    undo();
    QCOMPARE(cell(1, 3), QString("5-25,1"));
    QVERIFY(!isLine(screenOf(1, 25, 20), screenOf(1, 35, 20), MapKind::outputLine));
  }

  void anOutputPointIsDragged() {
    take(MapTool::outputPoint);
    click(screenOf(1, 10, 30));
    take(MapTool::select);
    dragSeen(screenOf(1, 10, 30), screenOf(1, 14, 36));
    QCOMPARE(undoName(), QString("Output 1, point 1"));
    QCOMPARE(feature(MapKind::outputPoints)->points->front(), area(1).grid.at(14, 36));
    QVERIFY(isSeen(screenOf(1, 14, 36), kHeld));  // its handle
    undo();
    QCOMPARE(feature(MapKind::outputPoints)->points->front(), area(1).grid.at(10, 30));
    QVERIFY(!isSeen(screenOf(1, 14, 36), kHeld));
  }

  void aBoxIsDraggedByItsCorner() {
    chooseModule("Hydrodynamic and Advection-Dispersion");
    const std::size_t before = canvas().scene().features.size();
    take(MapTool::box);
    drag(screenOf(1, 5, 40), screenOf(1, 20, 50));
    QCOMPARE(canvas().scene().features.size(), before + 1);
    const int page = tab().currentPage();
    const int row = tab().currentRow();
    QCOMPARE(page, kBoxes);
    take(MapTool::select);
    dragSeen(screenOf(1, 20, 50), screenOf(1, 26, 56));
    QCOMPARE(undoName(), QString("Box %1, point 3").arg(row));
    QCOMPARE(cell(row, 3), QString("(5,40)"));
    QCOMPARE(cell(row, 4), QString("(26,56)"));
    QVERIFY(isLine(screenOf(1, 26, 40), screenOf(1, 26, 56), MapKind::box));
    undo();
    QCOMPARE(cell(row, 4), QString("(20,50)"));
    QCOMPARE(undoName(), QString("New box"));
  }

  void whatKeysTypeInACellIsSeenAtOnce() {
    const auto typeInCell = [this](PagePlace place, const QString& text) {
      tab().goToPlace(place);
      typeKeys(text);
      pressKey(Qt::Key_Return);
      QCoreApplication::processEvents();
    };
    const PagePlace origin{.page = PageId::bathymetry, .entries = {{2}}, .column = 3};
    const GridPoint before = area(2).origin;
    typeInCell(origin, "40,30");
    QCOMPARE(area(2).origin, (GridPoint{40, 30}));
    QCOMPARE(undoName(), QString("Origin, row 2"));
    const auto border = [this] { return (screenOf(2, -0.5, 10) + screenOf(2, -0.5, 11)) / 2; };
    const QPointF there = border();
    QVERIFY(isSeen(there, layerColour(MapLayer::outlines)));
    // Where it can't be it is red.
    typeInCell(origin, "100,80");
    QVERIFY(!area(2).fault.empty());
    canvas().fit();
    constexpr QRgb kFault = 0xFFD31C1C;
    QVERIFY(isSeen(badgeOf(outlineOf(canvas().frame(), area(2).corners)) - QPointF(6, 0), QColor(kFault)));
    undo();
    undo();
    QCOMPARE(area(2).origin, before);
    QVERIFY(undoName().isEmpty());
    // And a source.
    take(MapTool::source);
    click(screenOf(1, 8, 10));
    take(MapTool::select);
    typeInCell({.page = PageId::sourceAndSink, .entries = {{1}}, .column = 2}, "14,16");
    QTRY_VERIFY_WITH_TIMEOUT(feature(MapKind::source)->points->front() == area(1).grid.at(14, 16), 200);
    const QColor green = featureColour(*feature(MapKind::source));
    QVERIFY(isSeen(screenOf(1, 14, 16) - QPointF(0, 14), green));  // its arrow
    QVERIFY(!isSeen(screenOf(1, 8, 10) - QPointF(0, 14), green));
  }
};

[[maybe_unused]] static const bool kMapDragsTest = addMapTest<MapDragsTest>();

}  // namespace gridbay::shell

#include "map_drags_test.moc"
