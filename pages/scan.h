#pragma once

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string_view>
#include <variant>

#include "core/grid_point.h"
#include "core/selections.h"

namespace gridbay {

// Texts as they are typed into cells: read from the front, as far as they make sense, whatever comes after.
// The decimal point is a point in every language.

// Without the white space at either end.
std::string_view trimmed(std::string_view text);

using ScanTarget = std::variant<std::int32_t*, float*, double*>;
// Reads a text by a form of "%d" and "%f", blanks and other characters; a blank stands for any white space,
// or none. Returns how many fields were read; those are set then, and the others are not.
int scan(std::string_view text, std::string_view form, std::initializer_list<ScanTarget> targets);

std::optional<std::int32_t> scannedInteger(std::string_view text);
std::optional<double> scannedReal(std::string_view text);
// "(3,14)" and "3,14"
std::optional<GridPoint> scannedPoint(std::string_view text);
// "3,14" alone
std::optional<GridPoint> scannedBarePoint(std::string_view text);
// "0-100,5"; without an interval it is 1.
std::optional<USubLine> scannedRange(std::string_view text);
// An integer read plainly: "12x" is 12, "x" is 0.
std::int32_t plainInteger(std::string_view text);

}  // namespace gridbay
