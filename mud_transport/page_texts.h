#pragma once

#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr FileKind waveFieldFile{"tsb2",
                                        "Wave fields (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

}  // namespace gridbay::texts
