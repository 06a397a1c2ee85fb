#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace gridbay {

// A point of a grid, J along x and K along y, both counted from 0.
struct GridPoint {
  std::int32_t j = 0;
  std::int32_t k = 0;

  bool operator==(const GridPoint&) const = default;
};

// "(3,14)"
std::string pointText(GridPoint point);
// Takes "(3,14)" and "3,14"; anything else gives nothing.
std::optional<GridPoint> pointOfText(std::string_view text);

}  // namespace gridbay
