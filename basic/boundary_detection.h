#pragma once

#include <vector>

#include "core/array2d.h"
#include "core/grid_point.h"

namespace gridbay {

// A straight run of grid points; a run of one point has two equal ends.
struct BoundaryLine {
  GridPoint first;
  GridPoint last;

  bool operator==(const BoundaryLine&) const = default;
};

// The runs of water (values below the land value) along the border of a grid: west, north, east, south, and
// on each edge by rising index. A wet corner is a part of both its edges. Only the border is looked at.
std::vector<BoundaryLine> findOpenBoundaries(const CVdArray2D<float>& grid, float landValue);

}  // namespace gridbay
