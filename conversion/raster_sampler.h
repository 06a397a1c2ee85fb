#pragma once

#include <functional>
#include <span>
#include <vector>

#include "conversion/raster.h"
#include "platform/result.h"

namespace gridbay {

// Values of the chosen band of a raster at any places, by the four points around each. Where one of them is
// land, or has no value, the nearest one counts, so that a coast stays where it is. It keeps some rows at a
// time.
class RasterSampler {
 public:
  // Brings places, pairs of x and y, into the raster's projection; those that it can't hold become infinite.
  using ToRaster = std::function<Outcome(std::span<double> pairs)>;

  // Values from `landValue` on are land; none are where it is not-a-number.
  RasterSampler(Raster& raster, float landValue, ToRaster toRaster);

  // Whole rows of a grid, from `firstRow` on; not-a-number where the raster has none, which it has up to half
  // a point beyond its outermost ones. An error when it can't be read.
  Outcome sampleRows(const RasterPlace& grid, int columns, int firstRow, std::span<float> values);

 private:
  struct Spot {
    double column;
    double row;
  };

  Outcome sample(std::span<double> pairs, std::span<float> values);
  Outcome sampleAt(std::span<const Spot> spots, std::span<float> values);
  bool isInside(Spot spot) const;
  Outcome keep(int first, int last);
  float at(int column, int row) const;
  float between(Spot spot) const;

  Raster& raster_;
  RasterPlace place_;
  ToRaster toRaster_;
  float land_;
  std::vector<float> kept_;
  int firstRow_ = 0;
  int rows_ = 0;
};

}  // namespace gridbay
