#pragma once

#include "core/string_table.h"
#include "families/texts.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

// Checks of outputs.
inline constexpr Text resultFileNotValid{"Filename: %s is not valid"};
inline constexpr Text associatedAreaMissing{"Assostiated area is does not exist"};
inline constexpr Text gridPointOutOfRange{"Grid point out of range"};
inline constexpr Text intervalTooSmall{"Intervals must be greater or equal to 1"};
inline constexpr Text firstPointBehindLast{"The first point is greater than the last"};
inline constexpr Text timeStepIntervalTooSmall{"Time step interval must be greater or equal to 1"};
inline constexpr Text wrongDimensionOfFile{"Wrong dimension of output file"};

// Pages of outputs.
inline constexpr Text associatedAreaInvalid{"Error: Associated area is invalid!"};
inline constexpr Text hotStartSize{" (size of output: %.2f MB)"};
inline constexpr Text megabytes{"%.2f MB"};
inline constexpr FileKind pointResultFile{
    "tsb0", "Time series (*.tsb0)|*.tsb0|Time series (*.tb0)|*.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind lineResultFile{
    "tsb1", "Profile (*.tsb1)|*.tsb1|Profile (*.tb1)|*.tb1|All Files (*.*)|*.*||"};
inline constexpr FileKind mapResultFile{
    "tsb2", "Result files(*.tsb2)|*.tsb2|Result files (*.tb2)|*.tb2|All Files (*.*)|*.*||"};

// The choice of points.
inline constexpr Text pointSelection{"Point Selection"};
inline constexpr Text coordinateNotNumeric{"Error: the value is not numeric"};
inline constexpr Text coordinateMissing{"Point Selection:\n\n    Missing coordinate"};
inline constexpr Text coordinateInvalid{"Point Selection:\n\n    Invalid coordinate"};

}  // namespace gridbay::texts
