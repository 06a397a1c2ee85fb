#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

inline constexpr Text weirName{"Weir %d"};
// Dikes.
inline constexpr Text dikeName{"Dike %d"};
inline constexpr Text crestLevelRequest{"Crest level"};

}  // namespace gridbay::texts
