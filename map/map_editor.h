#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "map/map_scene.h"
#include "pages/map_pick.h"

namespace gridbay {

// An area as an edit would place it.
struct AreaPlace {
  std::int32_t enclosing = 1;
  GridPoint origin;  // in the enclosing area
  std::int32_t nx = 0;
  std::int32_t ny = 0;
  MapGrid grid;
  std::array<MapPoint, 4> corners;
  std::string fault;  // why the area can't lie there
};

// A point of a feature as an edit would place it.
struct VertexPlace {
  MapPoint place;                  // snapped to the grid where the feature stands on one
  std::optional<GridPoint> point;  // of that grid
  std::string fault;
};

// A new feature as an edit would place it.
struct FeaturePlace {
  std::vector<MapPoint> points;    // snapped to the grid where the feature stands on one
  std::optional<GridPoint> point;  // of that grid: the last one
  std::string fault;
};

// The setup on a map, and what can be grasped there. Each edit is one undo step by its name; the text that it
// returns says why it can't be done, and is empty when it has been. All of it is virtual, as a host links
// nothing of it.
class MapEditor {
 public:
  virtual ~MapEditor() = default;

  // All that is placed as the setup is now; until the next call. Of grid files only the headers are read, and
  // again only when they have been written to.
  virtual const MapScene& scene() = 0;

  // The point of a grid at a place on the map: of the finest area there, or of one by its number. Nothing
  // where there is none. In the last scene, as `geographic` is.
  virtual std::optional<MapPick> pick(MapPoint place, std::int32_t area = 0) = 0;
  // A place on the map as a cell of a page takes it, and where on the map a place lies that it holds. Nothing
  // where there is no such point, or no way between the projections.
  virtual std::optional<PickedPlace> placeFor(const CellPick& cell, MapPoint place) = 0;
  virtual std::optional<MapPoint> placeOf(const CellPick& cell, const PickedPlace& held) = 0;
  // Longitude and latitude (degrees) of a place on the map; nothing in local coordinates.
  virtual std::optional<std::array<double, 2>> geographic(MapPoint place) = 0;

  // An area (from 2) whose first point is brought near a place: it snaps to the nearest point of its
  // enclosing area. An edit that would break a rule of nesting is made all the same, and is then told by the
  // scene; only what has no place on the enclosing grid at all can't be done.
  virtual AreaPlace previewMoveArea(std::int32_t number, MapPoint first) = 0;
  virtual std::string moveArea(std::int32_t number, MapPoint first) = 0;

  // The nested area that a rectangle of two opposite corners becomes, in the finest area that holds both: a
  // third of its spacing, an extent that nests.
  virtual AreaPlace previewNestedArea(MapPoint corner, MapPoint opposite) = 0;
  // Cuts its grid from a raster, or from another grid file, into a new file. The host shows how much is done,
  // and lets the user stop it.
  virtual std::string addNestedArea(MapPoint corner, MapPoint opposite, const std::string& raster,
                                    const std::string& file) = 0;

  // Points of a feature, from 0. Ends of user-specified boundaries slide along the border of Area 1. Corners
  // of polygons, points of outputs and points of dikes, weirs and culverts can be put in and taken out.
  virtual VertexPlace previewVertex(MapFeatureId feature, std::size_t vertex, MapPoint place) = 0;
  virtual std::string moveVertex(MapFeatureId feature, std::size_t vertex, MapPoint place) = 0;
  // The new point stands before `vertex`; at the end of the line where that is the number of points.
  virtual std::string insertVertex(MapFeatureId feature, std::size_t vertex, MapPoint place) = 0;
  virtual std::string removeVertex(MapFeatureId feature, std::size_t vertex) = 0;
  // With the points that there are so far, in the last scene: that more are needed is no fault.
  virtual FeaturePlace previewFeature(MapKind kind, const std::vector<MapPoint>& points,
                                      std::int32_t page = 0) = 0;
  // A new feature of its list with these points: a source (one point, or two for a pair), a sink is made of a
  // source on its page; an open boundary, an output, a polygon, a structure, a line or box of the module that
  // is chosen. Outputs are those of the flow calculation unless the page is that of the module's. With a
  // boundary, all boundaries become user-specified; one that is drawn over another takes its place.
  virtual std::string addFeature(MapKind kind, const std::vector<MapPoint>& points,
                                 std::int32_t page = 0) = 0;
  virtual std::string removeFeature(MapFeatureId feature) = 0;
};

}  // namespace gridbay
