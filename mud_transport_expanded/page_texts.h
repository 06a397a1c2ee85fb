#pragma once

#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr FileKind waveMapFile{"tsb2", "Wave Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

}  // namespace gridbay::texts
