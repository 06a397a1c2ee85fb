#pragma once

#include <string>

#include "platform/tsb/tsb_operations.h"

// What the grid file of an area says beside its values.

namespace gridbay {

// Of an area whose file names none.
inline constexpr float kNoLandValue = -999.0F;

// Of a hot start file the first item says in its first row how the area lies, and elevations follow it.
inline constexpr int kEnclosingPlace = 4;
inline constexpr int kOriginJPlace = 5;
inline constexpr int kOriginKPlace = 6;
constexpr int elevationItem(bool isHotStart) {
  return isHotStart ? 2 : 1;
}

// The projection by its text; "UTM" alone gets its zone from the longitude.
std::string completeProjection(const TsbGeography& place);

}  // namespace gridbay
