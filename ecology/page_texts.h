#pragma once

#include "core/string_table.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

// The model.
inline constexpr FileKind modelFile{"biorig", "BIO Rig Files (*.biorig)|*.biorig|All Files (*.*)|*.*||"};
inline constexpr Text cannotAccessFile{"Unable to access the file:\n%s"};
inline constexpr Text readingModel{"Reading the ecological model"};
inline constexpr Text symbolAndExpression{"%s = %s"};

// The files of constants, forcings and initial conditions.
inline constexpr FileKind type0File{"tsb0", "Type 0 Files (*.tsb0;*.tb0)|*.tsb0;*.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind type2File{"tsb2", "Type 2 Files (*.tsb2;*.tb2)|*.tsb2;*.tb2|All Files (*.*)|*.*||"};
inline constexpr Text areaRow{"Area %d"};

}  // namespace gridbay::texts
