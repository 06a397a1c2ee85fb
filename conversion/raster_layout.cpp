#include "conversion/raster_layout.h"

#include <algorithm>
#include <cmath>
#include <numbers>

#include "platform/tsb/tsb_types.h"

namespace gridbay {
namespace {

using Vector = std::array<double, 2>;

// What a file's last digits may shift the last row or column by, in points.
constexpr double kShift = 0.1;
constexpr double kNoComponent = 1e-9;

Vector times(const Vector& vector, double factor) {
  // The sum with zero makes no zero negative.
  return {vector[0] * factor + 0.0, vector[1] * factor + 0.0};
}

double lengthOf(const Vector& vector) {
  return std::hypot(vector[0], vector[1]);
}

}  // namespace

std::array<int, 2> pointsBetween(double least, double greatest, double first, double spacing, int count) {
  constexpr double kDigits = 1e-6;
  const auto point = [count](double exact) { return static_cast<int>(std::clamp<double>(exact, -1, count)); };
  return {std::max(point(std::ceil((least - first) / spacing - kDigits)), 0),
          std::min(point(std::floor((greatest - first) / spacing + kDigits)), count - 1)};
}

Result<RasterLayout> layoutOf(const RasterPlace& place, int columns, int rows) {
  RasterLayout layout;
  layout.columns = columns;
  layout.rows = rows;
  layout.dx = lengthOf(place.nextColumn);
  layout.dy = lengthOf(place.nextRow);
  if (!(layout.dx > 0 && layout.dy > 0) || !std::isfinite(layout.dx + layout.dy) ||
      !std::isfinite(place.first[0] + place.first[1])) {
    return Failure{"The raster's points have no distance from each other"};
  }
  const Vector& c = place.nextColumn;
  const Vector& r = place.nextRow;
  const double cosine = (c[0] * r[0] + c[1] * r[1]) / (layout.dx * layout.dy);
  const double extent = std::max(columns * layout.dx, rows * layout.dy);
  if (std::abs(cosine) * extent > kShift * std::min(layout.dx, layout.dy)) {
    return Failure{
        "The raster is slanted on the map: its rows and columns are not square to each other. "
        "Turn it north up first, as with gdalwarp"};
  }
  layout.rowsBackwards = c[0] * r[1] - c[1] * r[0] < 0;
  layout.alongJ = c;
  layout.alongK = times(r, layout.rowsBackwards ? -1 : 1);
  if (layout.alongK[1] < -kNoComponent * layout.dy) {
    layout.columnsBackwards = true;
    layout.rowsBackwards = !layout.rowsBackwards;
    layout.alongJ = times(layout.alongJ, -1);
    layout.alongK = times(layout.alongK, -1);
  }
  for (std::size_t i = 0; i < 2; ++i) {
    layout.first[i] = place.first[i] + (layout.columnsBackwards ? (columns - 1) * c[i] : 0) +
                      (layout.rowsBackwards ? (rows - 1) * r[i] : 0);
  }
  layout.rotation = std::atan2(-layout.alongJ[1], layout.alongJ[0]) * 180 / std::numbers::pi;
  if (!TsbGeography{{}, 0, 0, layout.rotation}.isTurned()) {
    layout.rotation = 0;
    layout.alongJ = {layout.dx, 0};
    layout.alongK = {0, layout.dy};
  }
  return layout;
}

}  // namespace gridbay
