#include "families/dispersion.h"

#include <algorithm>

namespace gridbay {

std::optional<GridSpacing> smallestSpacing(CKvsBase& object) {
  auto* basic = object.parts<BasicParts>();
  std::optional<GridSpacing> least;
  for (int number = 1; basic != nullptr && number <= basic->bathymetry->GetCount(); ++number) {
    const CBathymetryObjectKvs& area = *basic->bathymetry->GetArea(number);
    if (area.dx <= 0 || area.dy <= 0) continue;
    least = least ? GridSpacing{std::min(least->dx, area.dx), std::min(least->dy, area.dy)}
                  : GridSpacing{area.dx, area.dy};
  }
  return least;
}

}  // namespace gridbay
