#pragma once

#include <QPixmap>
#include <QPointer>
#include <QTimer>
#include <QWidget>
#include <functional>
#include <memory>

#include "shell/map/map_backgrounds.h"
#include "shell/map/map_drawing.h"
#include "shell/map/map_grasps.h"
#include "shell/map/map_tools.h"
#include "shell/map/terrain_store.h"
#include "shell/map/terrain_worker.h"

namespace gridbay::shell {

// The map: terrain below what the setup places. A click selects, a drag moves what is held or else the map,
// the wheel zooms. The last picture of the terrain is shown in its place at once while a finer one is made.
//
// Points of what is selected, numbers and borders of areas are dragged; a double click on a line puts a point
// in; Delete takes the chosen point out, or the feature. Esc drops what is held. Arrows (with Shift finely),
// +, - and Home move the map. Then a cross marks its middle, where Space does what a click does, and takes
// hold of what is dragged and lets it go.
class MapCanvas final : public QWidget {
  Q_OBJECT
 public:
  explicit MapCanvas(QWidget* parent);

  // Shows the map of a document, or none; the frame is that of the whole map unless one is given.
  void showMap(MapEditor* editor, const std::optional<MapFrame>& frame = {});
  // Takes the scene anew: the setup has changed.
  void refresh();
  void fit();
  void zoom(double factor);
  // Lights up, with no more ado, what a row of a page tells of.
  void selectFeature(const std::optional<MapFeatureId>& id, std::int32_t area = 0);

  void setMarks(std::vector<AdviceMark> marks);
  void setTool(MapTool tool);
  MapTool tool() const { return tool_; }
  // Has the user point at what a cell is to hold: `picked` tells it.
  void startPick(const CellPick& cell);
  // What the next click does with the tool in hand.
  QString hint() const;
  void setLayer(MapLayer layer, bool on);
  void setStyle(const TerrainStyle& style);
  const TerrainStyle& terrainStyle() const { return style_; }
  // The scale that colours have now; nothing before the first picture.
  const std::optional<TerrainScale>& scale() const { return scale_; }

  const MapFrame& frame() const { return frame_; }
  void setFrame(const MapFrame& frame);
  // Whether the whole map stays in view while the window changes its size.
  bool isFitted() const { return isFitted_; }
  const MapDrawing& drawing() const { return drawing_; }
  const MapScene& scene() const { return drawing_.scene(); }
  MapEditor* editor() const { return editor_; }
  const std::vector<TerrainArea>& terrain() const { return terrain_; }
  MapBackgrounds& backgrounds() { return *backgrounds_; }
  const MapBackgrounds& backgrounds() const { return *backgrounds_; }
  // Whether the picture is of this frame, in full.
  bool isSettled() const;
  bool isHolding() const { return grasp_ != nullptr; }
  // What is said of a place.
  QString textAt(MapPoint place) const;
  // Why something at a place can't be, and what it is.
  QString tipAt(QPointF at) const;

  QSize sizeHint() const override { return {480, 420}; }
  QSize minimumSizeHint() const override { return {200, 160}; }

 signals:
  void featureChosen(const gridbay::MapFeature& feature);
  void areaChosen(int number);
  // The advice of a mark, by their places in the document's list; none for a click elsewhere.
  void adviceChosen(const std::vector<int>& advice);
  void pointed(const QString& text);
  void picked(const std::vector<gridbay::PickedPlace>& places);
  // A new feature, or one whose place a new one took.
  void featureMade(const gridbay::MapFeature& feature);
  void nestedAreaWanted(gridbay::MapPoint corner, gridbay::MapPoint opposite);
  // An edit is about to be made: what is typed and not entered comes before it.
  void editing();
  void edited();
  void failed(const QString& text);
  // Another tool is in hand, or another click is next.
  void toolChanged();
  void scaleChanged();
  void sceneChanged();

 protected:
  bool event(QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void mouseDoubleClickEvent(QMouseEvent* event) override;
  void wheelEvent(QWheelEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void contextMenuEvent(QContextMenuEvent* event) override;
  void leaveEvent(QEvent* event) override;
  void focusOutEvent(QFocusEvent* event) override;

 private:
  void paintTerrain(QPainter& painter);
  void paintPlaced(QPainter& painter);
  void paintHeldText(QPainter& painter);
  void paintFaults(QPainter& painter);
  void paintCross(QPainter& painter);
  void pointByKeys();
  void pressMiddle();
  void forgetPlaced();
  void requestTerrain();
  void requestBase();
  void takePicture(const TerrainPicture& picture);
  void showCursor(QPointF at);
  void startDrag(QPointF at);
  bool placesByClicks() const { return clicks().most > 0; }
  MapClicks clicks() const;
  void click(QPointF at);
  void chooseAt(QPointF at);
  void complete();
  void chooseMade(MapKind kind, const std::vector<MapFeature>& before);
  std::int32_t pageOfTool() const;
  void drop();
  // Whether it was made.
  bool edit(const std::function<std::string()>& change);
  // Whether points of a feature can be edited one by one; says so where not.
  bool hasAllPoints(const MapFeature& feature);
  void removeChosen();
  bool isPolyline(const MapFeature& feature) const;

  MapEditor* editor_ = nullptr;
  MapDrawing drawing_;
  MapFrame frame_;
  bool isFitted_ = true;
  MapTool tool_ = MapTool::select;
  CellPick pick_;  // of that tool
  std::unique_ptr<MapGrasp> grasp_;
  QPointF pressed_;
  QPointF last_;
  bool isPressed_ = false;
  Qt::MouseButton button_ = Qt::NoButton;  // that is pressed
  bool isPanning_ = false;
  bool isDragged_ = false;
  bool isByKeys_ = false;  // the last move was made by keys
  MapPoint heldAt_;        // by keys

  TerrainStyle style_;
  TerrainStore store_;
  std::vector<TerrainArea> terrain_;
  std::optional<TerrainScale> scale_;
  int version_ = 0;  // of what the pictures are made of
  std::optional<TerrainPicture> base_;
  std::optional<TerrainPicture> coarse_;
  std::optional<TerrainPicture> fine_;
  TerrainWorker* worker_;
  MapBackgrounds* backgrounds_;

  // What is placed, as it was last drawn. Where that takes long it moves along with the map as a picture, and
  // is drawn anew once the map stands still.
  QPixmap placed_;
  MapFrame placedFrame_;
  double placedCost_ = 0;  // milliseconds
  QTimer standStill_;
};

}  // namespace gridbay::shell
