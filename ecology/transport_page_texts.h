#pragma once

#include "core/string_table.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr Text valueRange{"Range: %g - %g"};

// A transported variable at the head of its row or column: its number and its symbol.
inline constexpr Text variableHeader{"%d\r\n%s"};

inline constexpr Text variableBand{"State Variable :   %s"};

inline constexpr FileKind wqsSurfaceDepositionFile{
    "tsb2", "Surface Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind wqsSoilDepositionFile{
    "tsb2", "Soil Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

inline constexpr Text noHydrodynamicHotStart{"Hotstart Output not enabled in Hydrodynamic results"};
inline constexpr FileKind wqsHotStartResultFile{
    "tsb2", "HotStart files(*.tsb2)|*.tsb2|HotStart files (*.tb2)|*.tb2|All Files (*.*)|*.*||"};

}  // namespace gridbay::texts
