#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace gridbay {

// The shortest decimal text that reads back as the same number; a real always has a point or an exponent, so
// that it is told from an integer. Infinities are "inf" and "-inf", not-a-number is "nan".
class NumberText {
 public:
  explicit NumberText(std::int64_t number);
  explicit NumberText(float number);
  explicit NumberText(double number);

  std::string_view view() const { return {buffer_.data(), size_}; }

 private:
  bool setFewDecimals(double number);
  template <class Real>
  void setReal(Real number);

  std::array<char, 40> buffer_;
  std::size_t size_ = 0;
};

template <class Number>
std::string numberText(Number number) {
  return std::string(NumberText(number).view());
}

// A number of any numeric text. An integer that is out of range, or text with anything behind the number,
// gives nothing; a real given to an integer loses its fraction.
std::optional<std::int32_t> int32OfText(std::string_view text);
std::optional<float> floatOfText(std::string_view text);
std::optional<double> doubleOfText(std::string_view text);

}  // namespace gridbay
