#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

// Dispersion.
inline constexpr Text dispersionRequest{"Dispersion Coefficients"};
inline constexpr Text tooMuchDispersion{"Dispersion Coefficients : Too much Dispersion"};
inline constexpr Text maximumBelowMinimum{"Maximum value must be larger than minimum value"};

}  // namespace gridbay::texts
