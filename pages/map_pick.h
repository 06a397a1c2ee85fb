#pragma once

#include <cstdint>
#include <cstdlib>
#include <string>
#include <vector>

#include "core/grid_point.h"

namespace gridbay {

// A place that is pointed at on a map, as a cell holds it.
struct PickedPlace {
  std::int32_t area = 1;
  GridPoint point{};  // of that area
  double x = 0;       // coordinates, where a cell takes these
  double y = 0;
};

// What is pointed at on a map for a cell, and for those that hold the rest of the same points.
struct CellPick {
  enum class Of {
    area,        // points of one area
    finest,      // points of the finest area there is at each
    border,      // points of the border of an area
    coordinates  // places by their coordinates in a projection
  };
  enum class Shape {
    points,
    line,
    part  // of a grid, by two opposite corners
  };

  std::string name{};  // of what is pointed at, and of the edit
  Of of = Of::area;
  std::int32_t area = 1;
  std::string projection{};
  Shape shape = Shape::points;
  std::size_t least = 1;
  std::size_t most = 1;
  std::vector<PickedPlace> held{};  // at present
};

// The end of a line that follows the axis of the grid along which it is longer.
inline GridPoint alongAxis(GridPoint first, GridPoint last) {
  const bool alongJ = std::abs(first.j - last.j) >= std::abs(first.k - last.k);
  return alongJ ? GridPoint{last.j, first.k} : GridPoint{first.j, last.k};
}

}  // namespace gridbay
