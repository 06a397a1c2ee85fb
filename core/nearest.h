#pragma once

#include <span>
#include <string>
#include <string_view>

namespace gridbay {

// A text in small letters (those of ASCII).
std::string lowered(std::string_view text);

// How many letters to change, add or leave out to make one text the other.
std::size_t slipsBetween(std::string_view a, std::string_view b);

// The candidate that is fewest slips (letters changed, added or left out) from a text, case ignored; empty
// where none is near enough to be meant.
std::string_view nearestOf(std::string_view wanted, std::span<const std::string_view> candidates);

}  // namespace gridbay
