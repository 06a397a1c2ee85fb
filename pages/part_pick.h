#pragma once

#include <span>

#include "core/selections.h"
#include "pages/map_pick.h"

namespace gridbay {

// What is pointed at for a part of an area's grid: two opposite corners.
CellPick pickOfPart(const USubArea& part, std::int32_t area);
// The part between them, in which a line has no width; intervals stay as they are.
void takePart(USubArea& part, std::span<const PickedPlace> places, bool isLine);

}  // namespace gridbay
