#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace gridbay {

// The shortest decimal text that reads back as the same number; a real always has a point or an exponent, so
// that it is told from an integer. Infinities are "inf" and "-inf", not-a-number is "nan".
std::string numberText(std::int64_t number);
std::string numberText(float number);
std::string numberText(double number);

// A number of any numeric text. An integer that is out of range, or text with anything behind the number,
// gives nothing; a real given to an integer loses its fraction.
std::optional<std::int32_t> int32OfText(std::string_view text);
std::optional<float> floatOfText(std::string_view text);
std::optional<double> doubleOfText(std::string_view text);

}  // namespace gridbay
