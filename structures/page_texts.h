#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

inline constexpr Text levelWidthTitle{"Level-width"};
inline constexpr Text pointSelectionTitle{"Point Selection"};
// One of the two has two blanks.
inline constexpr Text weirHeadLosses{"Head  loss factors"};
inline constexpr Text culvertHeadLosses{"Head loss factors"};

}  // namespace gridbay::texts
