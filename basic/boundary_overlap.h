#pragma once

#include <algorithm>
#include <optional>

#include "core/grid_point.h"

namespace gridbay {

// The points that two boundaries, or two runs of points (each from `first` to `last`), along one line have in
// common, by their place on that line (J or K); a corner of the grid is a part of both its edges.
struct BoundarySpan {
  int low, high;
};
std::optional<BoundarySpan> commonOf(const auto& a, const auto& b) {
  const auto along = [](const auto& it, bool alongJ) {
    return alongJ ? BoundarySpan{std::min(it.first.j, it.last.j), std::max(it.first.j, it.last.j)}
                  : BoundarySpan{std::min(it.first.k, it.last.k), std::max(it.first.k, it.last.k)};
  };
  for (const bool alongJ : {false, true}) {
    const BoundarySpan acrossA = along(a, !alongJ);
    const BoundarySpan acrossB = along(b, !alongJ);
    if (acrossA.low != acrossA.high || acrossB.low != acrossB.high || acrossA.low != acrossB.low) continue;
    const BoundarySpan one = along(a, alongJ);
    const BoundarySpan two = along(b, alongJ);
    const BoundarySpan common{std::max(one.low, two.low), std::min(one.high, two.high)};
    if (common.low <= common.high) return common;
  }
  return std::nullopt;
}

}  // namespace gridbay
