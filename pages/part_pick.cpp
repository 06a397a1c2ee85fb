#include "pages/part_pick.h"

#include <algorithm>
#include <tuple>

namespace gridbay {

CellPick pickOfPart(const USubArea& part, std::int32_t area) {
  return {.name = "J and K",
          .area = area,
          .shape = CellPick::Shape::part,
          .most = 2,
          .held = {{.point = {part.x.first, part.y.first}}, {.point = {part.x.last, part.y.last}}}};
}

void takePart(USubArea& part, std::span<const PickedPlace> places, bool isLine) {
  const GridPoint first = places.front().point;
  const GridPoint last = isLine ? alongAxis(first, places.back().point) : places.back().point;
  std::tie(part.x.first, part.x.last) = std::minmax({first.j, last.j});
  std::tie(part.y.first, part.y.last) = std::minmax({first.k, last.k});
}

}  // namespace gridbay
