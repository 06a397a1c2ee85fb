#pragma once

#include <string>

#include "platform/tsb/tsb_operations.h"

// What the grid file of an area says beside its values.

namespace gridbay {

// Of an area whose file names none.
inline constexpr float kNoLandValue = -999.0F;

// The projection by its text; "UTM" alone gets its zone from the longitude.
std::string completeProjection(const TsbGeography& place);

}  // namespace gridbay
