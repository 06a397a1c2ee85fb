#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace gridbay {

// How many bytes of a UTF-8 text, at most `most`, hold whole letters only. Bytes that are no UTF-8 are each
// a letter.
std::size_t wholeLetters(std::string_view text, std::size_t most);

// The text on lines of at most `letters` letters each, broken behind a blank or a separator of a path where
// one stands in the second half of the line, and otherwise between two letters.
std::string onLines(std::string_view text, std::size_t letters);

}  // namespace gridbay
