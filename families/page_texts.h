#pragma once

#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr FileKind hotStartFile{"tsb2",
                                       "HotStart files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
// The series of lines, boxes and mass files.
inline constexpr FileKind massFile{"tsb0",
                                   "Time series files (*.tsb0;*.tb0) |*.tsb0;*.tb0|All Files (*.*) |*.*||"};

}  // namespace gridbay::texts
