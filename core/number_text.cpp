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
  if (!setFewDecimals(number)) setReal(number);
}

// Nearly all numbers of a setup have at most six decimals. Decimals of up to 15 digits are all different as
// doubles, so that one which gives the number back is the shortest there is.
bool NumberText::setFewDecimals(double number) {
  constexpr double kScale = 1e6;
  constexpr double kLeast = 1e-3;
  constexpr double kMost = 1e9;  // of what is 15 digits with its decimals
  const double size = std::abs(number);
  if (!(size >= kLeast && size < kMost)) return false;
  const auto scaled = static_cast<std::uint64_t>(size * kScale + 0.5);
  if (static_cast<double>(scaled) / kScale != size) return false;
  char* at = buffer_.data();
  if (number < 0) *at++ = '-';
  constexpr std::uint64_t kUnit = 1'000'000;
  at = std::to_chars(at, buffer_.data() + buffer_.size(), scaled / kUnit).ptr;
  *at++ = '.';
  auto decimals = static_cast<std::uint32_t>(scaled % kUnit);
  for (std::uint32_t unit = 100'000; unit > 0; unit /= 10) {
    *at++ = static_cast<char>('0' + decimals / unit);
    decimals %= unit;
    if (decimals == 0) break;
  }
  size_ = static_cast<std::size_t>(at - buffer_.data());
  return true;
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
