#include "advice/free_water.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "basic/boundary.h"

namespace gridbay {

FreeWater::FreeWater(AdviceContext& context, int area)
    : grid_(*context.grid(area)), taken_(context.coverOf(area)) {
  for (int number = 1; area == 1 && number <= context.model.boundary->GetCount(); ++number) {
    if (const std::optional<GridRectangle> points = pointsOf(*context.model.boundary->GetItem(number)))
      taken_.push_back(*points);
  }
  const GridFacts& grid = grid_;
  const int size = grid.blockSize;
  // Of a grid with no land value all may be water.
  const float land = grid.landValue < 0 ? INFINITY : grid.landValue;
  water_.resize(static_cast<std::size_t>(grid.lowestOfBlocks.endK()));
  for (int k = 0; k < grid.lowestOfBlocks.endK(); ++k) {
    std::vector<GridRectangle>& row = water_[static_cast<std::size_t>(k)];
    const int firstK = k * size;
    const int lastK = firstK + size - 1;
    for (int j = 0; j < grid.lowestOfBlocks.endJ(); ++j) {
      if (!(grid.lowestOfBlocks(j, k) < land)) continue;
      if (!(grid.highestOfBlocks(j, k) < land)) {
        const GridPoint deepest = grid.lowestPoint(j, k);
        row.push_back({deepest.j, deepest.j, deepest.k, deepest.k});
      } else if (!row.empty() && row.back().lastJ == j * size - 1 && row.back().lastK == lastK) {
        row.back().lastJ += size;
      } else {
        row.push_back({j * size, (j + 1) * size - 1, firstK, lastK});
      }
    }
  }
}

// Whether something lies on a point; then J becomes the first place beyond it.
bool FreeWater::isTaken(int& j, int k, bool isUp) const {
  const auto on =
      std::ranges::find_if(taken_, [&](const GridRectangle& each) { return each.contains(j, k); });
  if (on == taken_.end()) return false;
  j = isUp ? std::min(on->lastJ, grid_.noJ) + 1 : std::max(on->firstJ, 0) - 1;
  return true;
}

// The first free point of a row from J on.
std::optional<int> FreeWater::next(int j, int k, bool isUp) const {
  const std::vector<GridRectangle>& row = water_[static_cast<std::size_t>(k / grid_.blockSize)];
  const auto walk = [&](auto at, auto end) -> std::optional<int> {
    for (; at != end; ++at) {
      if (k < at->firstK || k > at->lastK) continue;
      j = isUp ? std::max(j, at->firstJ) : std::min(j, at->lastJ);
      while (at->firstJ <= j && j <= at->lastJ) {
        if (j < 1 || j > grid_.noJ - 2) return std::nullopt;
        if (!isTaken(j, k, isUp)) return j;
      }
    }
    return std::nullopt;
  };
  if (isUp) return walk(std::ranges::lower_bound(row, j, {}, &GridRectangle::lastJ), row.end());
  return walk(std::reverse_iterator(std::ranges::upper_bound(row, j, {}, &GridRectangle::firstJ)),
              row.rend());
}

std::optional<FreeWater::Place> FreeWater::nearest(GridPoint from) const {
  std::optional<Place> nearest;
  if (grid_.noJ < 3 || grid_.noK < 3) return nearest;
  const auto look = [&](int k) {
    if (k < 1 || k > grid_.noK - 2) return;
    for (const bool isUp : {false, true}) {
      const std::optional<int> j = next(std::clamp(from.j, 1, grid_.noJ - 2), k, isUp);
      if (!j) continue;
      const double metres = std::hypot((*j - from.j) * grid_.dx, (k - from.k) * grid_.dy);
      if (!nearest || metres < nearest->metres) nearest = Place{{*j, k}, metres};
    }
  };
  for (int away = 0; away < grid_.noK && !(nearest && away * grid_.dy >= nearest->metres); ++away) {
    look(from.k - away);
    if (away > 0) look(from.k + away);
  }
  return nearest;
}

}  // namespace gridbay
