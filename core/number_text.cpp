#include "core/number_text.h"

#include <fast_float/fast_float.h>
#include <fmt/compile.h>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>

namespace gridbay {
namespace {

template <class Real>
std::optional<Real> realOfText(std::string_view text) {
  Real number = 0;
  const auto [end, error] = fast_float::from_chars(text.data(), text.data() + text.size(), number);
  if (error != std::errc() || end != text.data() + text.size()) return std::nullopt;
  return number;
}

}  // namespace

NumberText::NumberText(std::int64_t number) {
  size_ = static_cast<std::size_t>(
      std::to_chars(buffer_.data(), buffer_.data() + buffer_.size(), number).ptr - buffer_.data());
}
NumberText::NumberText(float number) {
  setReal(number);
}
NumberText::NumberText(double number) {
  setReal(number);
}

template <class Real>
void NumberText::setReal(Real number) {
  constexpr std::string_view kPoint = ".0";
  char* end = fmt::format_to(buffer_.data(), FMT_COMPILE("{}"), number);
  const bool isReal = std::any_of(buffer_.data(), end, [](char c) { return c == '.' || c == 'e'; });
  if (!isReal && std::isfinite(number)) end = std::copy(kPoint.begin(), kPoint.end(), end);
  if (std::isnan(number)) end = std::copy_n("nan", 3, buffer_.data());  // whatever its sign
  size_ = static_cast<std::size_t>(end - buffer_.data());
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
