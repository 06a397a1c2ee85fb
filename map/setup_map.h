#pragma once

#include <functional>
#include <string>
#include <vector>

#include "core/page_id.h"
#include "map/grid_headers.h"
#include "map/grid_shapes.h"
#include "map/map_coordinates.h"
#include "map/map_edit.h"
#include "map/map_editor.h"
#include "map/structure_lines.h"
#include "platform/result.h"
#include "setup/global_kvs.h"

namespace gridbay {

// Where the coordinates of an area's own file put its first point in its enclosing area.
struct AreaSnap {
  std::array<double, 2> exact;  // J and K
  GridPoint nearest;
  double offBy = 0;      // from there to the nearest point (metres)
  double heldOffBy = 0;  // to the point that the setup names
};

// A model on a map, and the edits there (see MapEditor), with no document around it. What is read from files
// is kept from one call to the next.
class SetupMap {
 public:
  const MapScene& scene(CGlobalKvs& root);
  std::optional<MapPick> pick(MapPoint place, std::int32_t area) const;
  std::optional<PickedPlace> placeFor(const CellPick& cell, MapPoint place);
  std::optional<MapPoint> placeOf(const CellPick& cell, const PickedPlace& held);
  std::optional<std::array<double, 2>> geographic(MapPoint place) const;

  AreaPlace previewMoveArea(CGlobalKvs& root, std::int32_t number, MapPoint first);
  MapEdit moveArea(CGlobalKvs& root, std::int32_t number, MapPoint first);
  // By the coordinates of the grids; an error where they have none.
  Result<AreaSnap> snapOf(CGlobalKvs& root, std::int32_t number);
  AreaPlace previewNestedArea(CGlobalKvs& root, MapPoint corner, MapPoint opposite);
  // Why the setup can't have another area; empty where it can.
  static std::string noMoreAreas(const CGlobalKvs& root);
  // Another area at the end of the list, of a grid file that lies there.
  MapEdit addArea(CGlobalKvs& root, std::int32_t enclosing, GridPoint origin, const std::string& file);

  VertexPlace previewVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place);
  MapEdit moveVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place);
  MapEdit insertVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place);
  MapEdit removeVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex);
  FeaturePlace previewFeature(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points,
                              std::int32_t page = 0) const;
  MapEdit addFeature(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points,
                     std::int32_t page = 0);
  MapEdit removeFeature(CGlobalKvs& root, MapFeatureId feature);

  GridHeaders& headers() { return headers_; }
  MapCoordinates& coordinates() { return coordinates_; }

 private:
  // The points that an edit of one of them leads to; empty with a fault.
  struct Shaped {
    GridShape shape;
    GridPoint point;
    std::string fault;
  };
  Shaped shaped(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place);
  MapEdit insertPoint(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place);
  // A new feature on the points of grids: an output of the flow calculation stands on Area 1.
  struct NewShape {
    GridShape shape;
    std::string fault;
  };
  NewShape newShape(MapKind kind, const std::vector<MapPoint>& points, bool isOfFlow) const;
  MapEdit addOnGrid(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points);
  MapEdit addBoundary(CGlobalKvs& root, const std::vector<MapPoint>& points);
  MapEdit addModuleOutput(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points);
  MapEdit addLineOrBox(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points);
  // The number of the finest area that holds all points; 0 where none does.
  std::int32_t finestHolding(const std::vector<MapPoint>& points) const;
  MapEdit addStructure(CGlobalKvs& root, MapKind kind, std::vector<MapPoint> points);
  void appendOnGrids(CGlobalKvs& root);

  GridHeaders headers_;
  MapCoordinates coordinates_;
  StructureLines structures_;
  MapScene scene_;
};

// The point of the border of a grid to which the end of a boundary slides: on an edge that holds the other
// end, where there is one.
GridPoint slideAlongBorder(double j, double k, std::int32_t nx, std::int32_t ny,
                           std::optional<GridPoint> otherEnd);

}  // namespace gridbay
