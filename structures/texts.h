#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

inline constexpr Text weirName{"Weir %d"};

}  // namespace gridbay::texts
