#pragma once

#include <array>

#include "conversion/raster.h"
#include "platform/result.h"

namespace gridbay {

// How the rows and columns of a raster become those of a grid: J and K along square axes, y to the left of x
// as on a map, and K northwards (its direction less than 90 degrees from the projection's north, or due west
// or east).
struct RasterLayout {
  int columns = 0;
  int rows = 0;
  bool columnsBackwards = false;
  bool rowsBackwards = false;
  double dx = 1;  // between points, in the unit of the place
  double dy = 1;
  double rotation = 0;            // the direction of K in degrees clockwise from north
  std::array<double, 2> first{};  // the grid's point (0,0)
  std::array<double, 2> alongJ{1, 0};
  std::array<double, 2> alongK{0, 1};

  int column(int j) const { return columnsBackwards ? columns - 1 - j : j; }
  int row(int k) const { return rowsBackwards ? rows - 1 - k : k; }
  // What the grid's own axes begin at: a grid that is turned has its axes from its first point.
  std::array<double, 2> axesFirst() const { return rotation != 0 ? std::array{0.0, 0.0} : first; }
  // Eastwards and northwards in the projection.
  std::array<double, 2> at(int j, int k) const {
    return {first[0] + j * alongJ[0] + k * alongK[0], first[1] + j * alongJ[1] + k * alongK[1]};
  }
};

// The points of `count` along an axis, from 0, whose coordinates lie between two; the last is before the
// first where there are none. Coordinates may be rounded by a little of the spacing.
std::array<int, 2> pointsBetween(double least, double greatest, double first, double spacing, int count);

// An error where the axes are not square to each other, or points lie on one another.
Result<RasterLayout> layoutOf(const RasterPlace& place, int columns, int rows);

}  // namespace gridbay
