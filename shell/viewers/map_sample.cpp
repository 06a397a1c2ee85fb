#include "shell/viewers/map_sample.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "core/land_value.h"
#include "platform/units/units.h"

namespace gridbay::shell {

bool MapSample::range(double* least, double* greatest) const {
  bool found = false;
  for (const float value : values) {
    if (!std::isfinite(value)) continue;
    *least = found ? std::min(*least, double{value}) : value;
    *greatest = found ? std::max(*greatest, double{value}) : value;
    found = true;
  }
  return found;
}

float landLimitOf(const TsbDefinition& definition, std::size_t item) {
  constexpr float kNone = std::numeric_limits<float>::infinity();
  if (definition.items[item - 1].type != item::kBathymetry) return kNone;
  const Result<std::optional<float>> land = landValueOf(definition);
  return land ? land->value_or(kNone) : kNone;
}

Result<MapSample> sampleMap(const TsbFile& file, std::size_t item, std::size_t step, const MapWindow& window,
                            std::size_t most) {
  const std::size_t across = window.lastJ - window.firstJ + 1;
  const std::size_t along = window.lastK - window.firstK + 1;
  const std::size_t width = file.definition().axes[0].points;
  MapSample sample{.firstJ = window.firstJ, .firstK = window.firstK};
  sample.stride = std::max<std::size_t>(1, (std::max(across, along) + most - 1) / most);
  sample.columns = (across - 1) / sample.stride + 1;
  sample.rows = (along - 1) / sample.stride + 1;
  sample.values.reserve(sample.columns * sample.rows);

  const float land = landLimitOf(file.definition(), item);
  const auto missing = static_cast<float>(file.definition().items[item - 1].deleteValue);
  std::vector<float> row(width);
  for (std::size_t r = 0; r < sample.rows; ++r) {
    if (Outcome read = file.readRows(item, step, sample.firstK + r * sample.stride, row); !read)
      return Failure{read.error()};
    for (std::size_t c = 0; c < sample.columns; ++c) {
      const float value = row[sample.firstJ + c * sample.stride];
      sample.values.push_back(value >= land || value == missing ? std::numeric_limits<float>::quiet_NaN()
                                                                : value);
    }
  }
  return sample;
}

}  // namespace gridbay::shell
