#pragma once

#include <cstddef>
#include <vector>

#include "platform/result.h"
#include "platform/tsb/tsb_file.h"

namespace gridbay::shell {

// Some points of a map: every `stride`-th one of a window, so that a map of any size fills a screen at once.
struct MapSample {
  std::size_t firstJ = 0;
  std::size_t firstK = 0;
  std::size_t stride = 1;  // the same along both axes
  std::size_t columns = 0;
  std::size_t rows = 0;
  std::vector<float> values = {};  // along J first; not-a-number for land and missing values

  float at(std::size_t column, std::size_t row) const { return values[row * columns + column]; }
  // Least and greatest value; false when there is none.
  bool range(double* least, double* greatest) const;
};

// A window of grid points, from 0, both ends within.
struct MapWindow {
  std::size_t firstJ;
  std::size_t lastJ;
  std::size_t firstK;
  std::size_t lastK;
};

// Whether an item's values at or above a land value are land, and from where. Infinite where there is no
// land.
float landLimitOf(const TsbDefinition& definition, std::size_t item);

// Reads an item (from 1) at a time step (from 0), with no more points along either axis than `most`. Only the
// rows that are shown are read.
Result<MapSample> sampleMap(const TsbFile& file, std::size_t item, std::size_t step, const MapWindow& window,
                            std::size_t most);

}  // namespace gridbay::shell
