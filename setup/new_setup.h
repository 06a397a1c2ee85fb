#pragma once

#include <optional>
#include <span>
#include <string>

#include "core/grid_point.h"
#include "setup/global_kvs.h"

namespace gridbay {

// The grid of an area of a new setup. A nested one says where it lies: at the point of the enclosing grid
// that holds its first point, in the area of that number (from 1), which is the one before it where it is not
// told.
struct NewArea {
  std::string file;  // absolute, or from the current folder
  std::optional<GridPoint> origin = {};
  std::optional<int> enclosing = {};
};

// Why areas cannot be laid out.
struct AreaFault {
  std::string text;
  std::size_t area = 0;   // from 1; 0 where there are too many
  bool isOfFile = false;  // it is no grid that can be read
};

// Gives a new model its areas, the outermost first, and what follows from their grids; the model is as it was
// where that cannot be: more areas than the edition has, a first one that lies in another, a nested one that
// does not say where, or beyond the enclosing grid, or in an area that does not come before it, a file that
// is no map.
std::optional<AreaFault> layAreas(CGlobalKvs& model, std::span<const NewArea> areas);

// What follows from the grid of the first area: the projection, where none is set, and the open boundaries.
void followFirstGrid(CGlobalKvs& model);

}  // namespace gridbay
