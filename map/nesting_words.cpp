#include "map/nesting_words.h"

#include <fmt/format.h>

#include "basic/nesting.h"
#include "map/map_areas.h"

namespace gridbay {
namespace {

// A point of the outer grid, which may lie between two.
std::string placeText(const MapArea& inner) {
  return fmt::format("({:.6g},{:.6g})", inner.origin.j + (inner.nx - 1) / double{kNestingRatio},
                     inner.origin.k + (inner.ny - 1) / double{kNestingRatio});
}

// The most points along an edge that fit in from an origin; less than 2 where none do.
int mostPoints(std::int32_t origin, std::int32_t outerPoints) {
  return origin < 1 ? 0 : kNestingRatio * (outerPoints - 2 - origin) + 1;
}

}  // namespace

std::string nestingWords(const MapArea& inner, const MapArea& outer) {
  if (nestsIn(inner, outer)) return {};
  std::string words = fmt::format(
      "Area {} has {} x {} points, {:.6g} x {:.6g} m apart: it goes from {} to {} of area {}, whose last "
      "point is "
      "({},{}).\nWhat nests there is {:.6g} x {:.6g} m apart and lies from (1,1) to ({},{}), with 1 + a "
      "multiple "
      "of {} points along each edge",
      inner.number, inner.nx, inner.ny, inner.dx, inner.dy, pointText(inner.origin), placeText(inner),
      outer.number, outer.nx - 1, outer.ny - 1, outer.dx / kNestingRatio, outer.dy / kNestingRatio,
      outer.nx - 2, outer.ny - 2, kNestingRatio);
  const int mostJ = mostPoints(inner.origin.j, outer.nx);
  const int mostK = mostPoints(inner.origin.k, outer.ny);
  if (mostJ > 1 && mostK > 1)
    words +=
        fmt::format(": 4, 7, 10 and so on, at most {} x {} from {}", mostJ, mostK, pointText(inner.origin));
  return words;
}

}  // namespace gridbay
