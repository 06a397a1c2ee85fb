#pragma once

#include <string>

#include "platform/tsb/tsb_operations.h"

// What the grid file of an area says beside its values.

namespace gridbay {

// Of an area whose file names none.
inline constexpr float kNoLandValue = -999.0F;

// The land value stands in a custom block; without one `landValue` stays. False when the blocks cannot be
// read to that point.
bool readLandValue(const TsbHeader& header, float& landValue);

// The projection by its text; "UTM" alone gets its zone from the longitude.
std::string completeProjection(const TsbGeography& place);

}  // namespace gridbay
