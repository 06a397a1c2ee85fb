#pragma once

#include <optional>
#include <string>
#include <vector>

#include "map/map_scene.h"
#include "setup/global_kvs.h"

// What the setup places on the points of a grid, whatever part of the model holds it.

namespace gridbay {

struct GridShape {
  std::vector<GridPoint> points;
  std::vector<std::int32_t> areas;  // of each point
  bool closed = false;
  bool joined = true;

  std::int32_t area() const { return areas.empty() ? 0 : areas.front(); }
};

// All features of this kind in the order of their lists: those of modules only where the module is chosen.
struct ListedShape {
  MapFeatureId id;
  std::string label;
  MapDrive drive = MapDrive::none;
  std::int32_t row = 0;
  std::int32_t column = 0;
};
std::vector<ListedShape> listedShapes(CGlobalKvs& root);

// Nothing for one that is not there, or stands on no grid.
std::optional<GridShape> shapeOf(CGlobalKvs& root, MapFeatureId id);
// Gives a feature other points on the areas that it stands on; of a rectangle all four corners.
void giveShape(CGlobalKvs& root, MapFeatureId id, const GridShape& shape);

// Whether points can be put in and taken out, and how few there must be.
struct ShapeRule {
  bool canGrow = false;
  std::size_t least = 1;
};
ShapeRule shapeRule(MapKind kind);

// Corners of a rectangle by two opposite ones.
std::vector<GridPoint> rectangleOf(GridPoint a, GridPoint b);

}  // namespace gridbay
