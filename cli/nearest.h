#pragma once

#include <span>
#include <string>
#include <string_view>

namespace gridbay::cli {

// A text in small letters (those of ASCII).
std::string lowered(std::string_view text);

// The candidate that is fewest slips (letters changed, added or left out) from a text, case ignored; empty
// where none is near enough to be meant.
std::string_view nearestOf(std::string_view wanted, std::span<const std::string_view> candidates);

}  // namespace gridbay::cli
