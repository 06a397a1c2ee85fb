#pragma once

#include "core/string_table.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr FileKind bathymetryFile{"tsb2",
                                         "Bathymetry (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind fineBathymetry{"tsb2", "Bathymetry Files (*.tsb2)|*.tsb2||"};
inline constexpr Text recalculateBoundaries{
    "Recalculate Boundaries?\r\nNote: Recalculating boundaries will cause all boundary information to be "
    "reset to default."};
inline constexpr Text area1First{"The bathymetry of Area 1 must be defined first."};
inline constexpr Text view{"View..."};
inline constexpr Text browse{"   ...   "};

}  // namespace gridbay::texts
