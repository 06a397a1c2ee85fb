#include "core/number_text.h"

#include <fast_float/fast_float.h>

#include <array>
#include <charconv>
#include <cmath>
#include <limits>

namespace gridbay {
namespace {

template <class Number>
std::string shortest(Number number) {
  std::array<char, 64> buffer{};
  const auto [end, error] = std::to_chars(buffer.data(), buffer.data() + buffer.size(), number);
  return {buffer.data(), end};
}

template <class Real>
std::string realText(Real number) {
  if (std::isnan(number)) return "nan";
  if (std::isinf(number)) return number < 0 ? "-inf" : "inf";
  std::string text = shortest(number);
  if (text.find_first_of(".e") == std::string::npos) text += ".0";
  return text;
}

template <class Real>
std::optional<Real> realOfText(std::string_view text) {
  Real number = 0;
  const auto [end, error] = fast_float::from_chars(text.data(), text.data() + text.size(), number);
  if (error != std::errc() || end != text.data() + text.size()) return std::nullopt;
  return number;
}

}  // namespace

std::string numberText(std::int64_t number) {
  return shortest(number);
}
std::string numberText(float number) {
  return realText(number);
}
std::string numberText(double number) {
  return realText(number);
}

std::optional<std::int32_t> int32OfText(std::string_view text) {
  std::int32_t number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  if (error == std::errc() && end == text.data() + text.size()) return number;
  const std::optional<double> real = doubleOfText(text);
  constexpr double kLowest = std::numeric_limits<std::int32_t>::min();
  constexpr double kHighest = std::numeric_limits<std::int32_t>::max();
  if (!real || !(*real > kLowest - 1 && *real < kHighest + 1)) return std::nullopt;
  return static_cast<std::int32_t>(*real);
}

std::optional<float> floatOfText(std::string_view text) {
  return realOfText<float>(text);
}
std::optional<double> doubleOfText(std::string_view text) {
  return realOfText<double>(text);
}

}  // namespace gridbay
