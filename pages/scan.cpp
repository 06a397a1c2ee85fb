#include "pages/scan.h"

#include <charconv>
#include <cmath>
#include <limits>

namespace gridbay {
namespace {

constexpr std::string_view kWhite = " \t\r\n\f\v";

void skipWhite(std::string_view& text) {
  text.remove_prefix(std::min(text.find_first_not_of(kWhite), text.size()));
}

template <class Number>
std::errc take(std::string_view& text, Number& number) {
  skipWhite(text);
  std::string_view digits = text;
  if (digits.starts_with('+') && !digits.substr(1).starts_with('-')) digits.remove_prefix(1);
  Number read{};
  const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), read);
  if (error != std::errc()) return error;
  if constexpr (std::is_floating_point_v<Number>) {
    if (!std::isfinite(read)) return std::errc::invalid_argument;
  }
  number = read;
  text = digits.substr(static_cast<std::size_t>(end - digits.data()));
  return {};
}

}  // namespace

std::string_view trimmed(std::string_view text) {
  skipWhite(text);
  return text.substr(0, text.find_last_not_of(kWhite) + 1);
}

int scan(std::string_view text, std::string_view form, std::initializer_list<ScanTarget> targets) {
  int read = 0;
  for (const ScanTarget* target = targets.begin(); !form.empty(); form.remove_prefix(1)) {
    if (form.starts_with('%')) {
      if (target == targets.end() ||
          std::visit([&text](auto* number) { return take(text, *number); }, *target) != std::errc())
        return read;
      ++target;
      ++read;
      form.remove_prefix(1);  // the letter goes with the loop
      continue;
    }
    skipWhite(text);
    if (form.starts_with(' ')) continue;
    if (!text.starts_with(form.front())) return read;
    text.remove_prefix(1);
  }
  return read;
}

std::optional<std::int32_t> scannedInteger(std::string_view text) {
  std::int32_t number = 0;
  return scan(text, "%d", {&number}) == 1 ? std::optional(number) : std::nullopt;
}

std::optional<double> scannedReal(std::string_view text) {
  double number = 0;
  return scan(text, "%f", {&number}) == 1 ? std::optional(number) : std::nullopt;
}

std::optional<GridPoint> scannedPoint(std::string_view text) {
  GridPoint point;
  if (scan(text, "(%d,%d)", {&point.j, &point.k}) == 2) return point;
  return scannedBarePoint(text);
}

std::optional<GridPoint> scannedBarePoint(std::string_view text) {
  GridPoint point;
  return scan(text, "%d,%d", {&point.j, &point.k}) == 2 ? std::optional(point) : std::nullopt;
}

std::optional<USubLine> scannedRange(std::string_view text) {
  USubLine range;
  const int read = scan(text, "%d-%d,%d", {&range.first, &range.last, &range.interval});
  if (read < 3) range.interval = 1;
  return read < 2 ? std::nullopt : std::optional(range);
}

std::int32_t plainInteger(std::string_view text) {
  std::int32_t number = 0;
  if (take(text, number) != std::errc::result_out_of_range) return number;
  using Limits = std::numeric_limits<std::int32_t>;
  return text.starts_with('-') ? Limits::min() : Limits::max();
}

}  // namespace gridbay
