#include "conversion/raster_sampler.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <optional>

namespace gridbay {
namespace {

constexpr float kNoValue = std::numeric_limits<float>::quiet_NaN();
constexpr std::size_t kMostKept = std::size_t{1} << 23;  // points of a raster, unless two rows have more
constexpr int kSampleBlock = 256;                        // points along the edge of what is sampled at once

}  // namespace

RasterSampler::RasterSampler(Raster& raster, float landValue, ToRaster toRaster)
    : raster_(raster), place_(raster.place()), toRaster_(std::move(toRaster)), land_(landValue) {}

// Block by block, so that the points of a raster that is turned against the grid lie near each other.
Outcome RasterSampler::sampleRows(const RasterPlace& grid, int columns, int firstRow,
                                  std::span<float> values) {
  const auto across = static_cast<std::size_t>(columns);
  const int rows = static_cast<int>(values.size() / across);
  std::vector<double> pairs;
  std::vector<float> block;
  for (int low = 0; low < rows; low += kSampleBlock) {
    const int high = std::min(low + kSampleBlock, rows);
    for (int left = 0; left < columns; left += kSampleBlock) {
      const int right = std::min(left + kSampleBlock, columns);
      pairs.clear();
      for (int k = firstRow + low; k < firstRow + high; ++k) {
        for (int j = left; j < right; ++j) {
          for (std::size_t i = 0; i < 2; ++i)
            pairs.push_back(grid.first[i] + j * grid.nextColumn[i] + k * grid.nextRow[i]);
        }
      }
      block.resize(pairs.size() / 2);
      if (const Outcome done = sample(pairs, block); !done) return done;
      const auto width = static_cast<std::size_t>(right - left);
      for (auto row = static_cast<std::size_t>(low); row < static_cast<std::size_t>(high); ++row) {
        const std::span<const float> line =
            std::span(block).subspan((row - static_cast<std::size_t>(low)) * width, width);
        std::ranges::copy(line, values.subspan(row * across + static_cast<std::size_t>(left)).begin());
      }
    }
  }
  return {};
}

Outcome RasterSampler::sample(std::span<double> pairs, std::span<float> values) {
  if (Outcome done = toRaster_(pairs); !done) return done;
  const auto& [firstX, firstY] = place_.first;
  const auto& [columnX, columnY] = place_.nextColumn;
  const auto& [rowX, rowY] = place_.nextRow;
  const double determinant = columnX * rowY - rowX * columnY;
  std::vector<Spot> spots;
  spots.reserve(values.size());
  for (std::size_t i = 0; i + 1 < pairs.size(); i += 2) {
    const double x = pairs[i] - firstX;
    const double y = pairs[i + 1] - firstY;
    spots.push_back({(x * rowY - y * rowX) / determinant, (y * columnX - x * columnY) / determinant});
  }
  std::ranges::fill(values, kNoValue);
  return sampleAt(spots, values);
}

// What needs too much of the raster at once is done in two halves.
Outcome RasterSampler::sampleAt(std::span<const Spot> spots, std::span<float> values) {
  int least = raster_.rows();
  int most = -1;
  for (const Spot& spot : spots) {
    if (!isInside(spot)) continue;
    least = std::min(least, static_cast<int>(std::max(std::floor(spot.row), 0.0)));
    most = std::max(most, std::min(static_cast<int>(std::floor(spot.row)) + 1, raster_.rows() - 1));
  }
  if (most < least) return {};
  const auto needed =
      static_cast<std::size_t>(most - least + 1) * static_cast<std::size_t>(raster_.columns());
  if (needed > kMostKept && spots.size() > 1) {
    const std::size_t half = spots.size() / 2;
    if (const Outcome done = sampleAt(spots.first(half), values.first(half)); !done) return done;
    return sampleAt(spots.subspan(half), values.subspan(half));
  }
  if (const Outcome done = keep(least, most); !done) return done;
  for (std::size_t i = 0; i < spots.size(); ++i) {
    if (isInside(spots[i])) values[i] = between(spots[i]);
  }
  return {};
}

bool RasterSampler::isInside(Spot spot) const {
  constexpr double kHalf = 0.5 + 1e-6;
  return spot.column >= -kHalf && spot.row >= -kHalf && spot.column <= raster_.columns() - 1 + kHalf &&
         spot.row <= raster_.rows() - 1 + kHalf;
}

Outcome RasterSampler::keep(int first, int last) {
  if (first >= firstRow_ && last < firstRow_ + rows_) return {};
  rows_ = last - first + 1;
  firstRow_ = first;
  kept_.resize(static_cast<std::size_t>(raster_.columns()) * static_cast<std::size_t>(rows_));
  std::string why;
  if (raster_.read(first, kept_, &why)) return {};
  rows_ = 0;
  return Failure{why};
}

float RasterSampler::at(int column, int row) const {
  const std::optional<double> missing = raster_.missingValue();
  const float value =
      kept_[static_cast<std::size_t>(row - firstRow_) * static_cast<std::size_t>(raster_.columns()) +
            static_cast<std::size_t>(column)];
  return missing && value == static_cast<float>(*missing) ? kNoValue : value;
}

float RasterSampler::between(Spot spot) const {
  const double column = std::clamp(spot.column, 0.0, raster_.columns() - 1.0);
  const double row = std::clamp(spot.row, 0.0, raster_.rows() - 1.0);
  const int left = static_cast<int>(column);
  const int low = static_cast<int>(row);
  const int right = std::min(left + 1, raster_.columns() - 1);
  const int high = std::min(low + 1, raster_.rows() - 1);
  const double x = column - left;
  const double y = row - low;
  const std::array<float, 4> near{at(left, low), at(right, low), at(left, high), at(right, high)};
  const auto isSpecial = [this](float value) { return !std::isfinite(value) || value >= land_; };
  if (std::ranges::any_of(near, isSpecial)) return near[(x > 0.5 ? 1U : 0U) + (y > 0.5 ? 2U : 0U)];
  return static_cast<float>((near[0] * (1 - x) + near[1] * x) * (1 - y) +
                            (near[2] * (1 - x) + near[3] * x) * y);
}

}  // namespace gridbay
