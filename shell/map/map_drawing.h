#pragma once

#include <QHash>
#include <QPainter>
#include <QPoint>
#include <optional>
#include <vector>

#include "shell/map/advice_marks.h"
#include "shell/map/map_frame.h"
#include "shell/map/map_layers.h"
#include "shell/map/terrain_picture.h"

namespace gridbay::shell {

// What is lit up: a feature, with one of its points perhaps, or an area; 0 for none.
struct MapSelection {
  std::optional<MapFeatureId> feature;
  std::optional<std::size_t> vertex;
  std::int32_t area = 0;

  bool operator==(const MapSelection&) const = default;
};

// What lies at a place of the picture.
struct MapHit {
  std::optional<MapFeatureId> feature;
  std::optional<std::size_t> vertex;   // of the feature: the point itself
  std::optional<std::size_t> segment;  // from this point to the next one
  std::int32_t area = 0;               // the finest one there, or the one whose border is hit
  bool isBorder = false;               // its outline or number
  std::optional<std::size_t> mark;     // of advice, which lies above all else
};

// Draws what a scene places over the terrain, for the screen as for paper, and finds it again under the
// pointer.
class MapDrawing {
 public:
  void setScene(MapScene scene);
  const MapScene& scene() const { return scene_; }
  const MapFeature* feature(const MapFeatureId& id) const;

  MapLayers layers = MapLayers().set();
  MapSelection selection;
  std::vector<AdviceMark> marks;

  void paint(QPainter& painter, const MapFrame& frame) const;
  // Scale bar, north arrow, colour scale and the name of the projection.
  void paintLegend(QPainter& painter, const MapFrame& frame, const TerrainStyle& style,
                   const std::optional<TerrainScale>& scale) const;
  // The selected feature comes first, then the others from the top, then the borders of areas.
  MapHit hit(const MapFrame& frame, QPointF at) const;

 private:
  // A feature with what it covers on the map, and what each run of its points does, up to the point after it.
  struct Placed {
    const MapFeature* feature;
    QRectF cover;
    std::vector<QRectF> runs;
  };
  // The point and the segment of a feature that are nearest to a place.
  struct Nearest {
    std::optional<std::size_t> vertex;
    std::optional<std::size_t> segment;
  };
  static Nearest nearestOf(const Placed& placed, const MapFrame& frame, QPointF at);
  // A name or number beside its feature, or on it.
  struct Label {
    QPointF place;
    QString text;
    QColor colour;
    bool isBeside = false;  // the mark at the place stays free
    bool isLit = false;
    bool isKept = false;  // it has its place, however small its feature is
  };
  // What of a picture is taken, by the squares that it reaches into.
  class Room {
   public:
    void take(const QRectF& box);
    bool isFree(const QRectF& box) const;

   private:
    static QRect squaresOf(const QRectF& box);
    QHash<QPoint, QList<QRectF>> taken_;
  };
  // What a picture has labels of, and what of it they leave free.
  struct Labels {
    std::vector<Label> all;
    Room room;
  };
  bool shows(MapLayer layer) const { return layers.test(placeOf(layer)); }
  void paintAreas(QPainter& painter, const MapFrame& frame, Labels& labels) const;
  void paintGridLines(QPainter& painter, const MapFrame& frame) const;
  void paintFeature(QPainter& painter, const MapFrame& frame, const MapFeature& feature,
                    Labels& labels) const;
  void paintMarks(QPainter& painter, const MapFeature& feature, const QPolygonF& line,
                  const QColor& colour) const;
  void addLabel(const MapFrame& frame, const MapFeature& feature, const QPolygonF& line, const QColor& colour,
                Labels& labels) const;
  static std::vector<QPointF> shiftsOf(const Label& label, QSizeF size);
  static void paintLabels(QPainter& painter, const MapFrame& frame, Labels& labels);
  static void paintScale(QPainter& painter, const QRectF& bar, TerrainColours colours,
                         const TerrainScale& scale);
  void paintAdvice(QPainter& painter, const MapFrame& frame) const;
  void paintHandles(QPainter& painter, const MapFrame& frame, const std::vector<MapPoint>& points) const;

  MapScene scene_;
  std::vector<Placed> placed_;
};

// A line of the map on the screen; points that fall on one pixel are left out of long ones.
QPolygonF onScreen(const MapFrame& frame, const std::vector<MapPoint>& points);
QPolygonF outlineOf(const MapFrame& frame, const std::array<MapPoint, 4>& corners);
// A text on a ground of its own, that is read on any terrain.
void paintBadge(QPainter& painter, QPointF middle, const QString& text, const QColor& ground);
// The middle of an area's number on the screen.
QPointF badgeOf(const QPolygonF& outline);

}  // namespace gridbay::shell
