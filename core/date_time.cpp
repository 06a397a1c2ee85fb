#include "core/date_time.h"

#include <fmt/format.h>

#include <charconv>
#include <chrono>
#include <cmath>

namespace gridbay {
namespace {

using std::chrono::sys_days;
using std::chrono::year_month_day;

constexpr double kSecondsOfDay = 86400;
constexpr sys_days kDayZero = std::chrono::year{1899} / 12 / 30;
constexpr int kFirstYear = 100;
constexpr int kLastYear = 9999;

}  // namespace

DateTime DateTime::of(std::array<std::int32_t, 6> parts) {
  const auto [year, month, day, hour, minute, second] = parts;
  if (year < kFirstYear || year > kLastYear || month < 1 || month > 12 || day < 1 || day > 31)
    return invalid();
  const year_month_day date{std::chrono::year{year}, std::chrono::month{static_cast<unsigned>(month)},
                            std::chrono::day{static_cast<unsigned>(day)}};
  if (!date.ok() || hour < 0 || hour > 23 || minute < 0 || minute > 59 || second < 0 || second > 59)
    return invalid();
  const auto days = static_cast<double>((sys_days{date} - kDayZero).count());
  return fromLinear(days + (hour * 3600 + minute * 60 + second) / kSecondsOfDay);
}

DateTime DateTime::fromLinear(double days) {
  if (days >= 0) return {days, 0};
  const double whole = std::floor(days);
  return {whole - (days - whole), 0};
}

double DateTime::linear() const {
  if (day >= 0) return day;
  const double whole = std::ceil(day);
  return whole + (whole - day);
}

std::optional<std::array<std::int32_t, 6>> DateTime::parts() const {
  if (!valid() || !std::isfinite(day) || std::abs(day) > 3e6) return std::nullopt;
  const auto seconds = std::llround(linear() * kSecondsOfDay);
  const auto days = static_cast<std::int64_t>(std::floor(static_cast<double>(seconds) / kSecondsOfDay));
  const auto left = static_cast<std::int32_t>(seconds - days * 86400);
  const year_month_day date{kDayZero + std::chrono::days{days}};
  const int year = static_cast<int>(date.year());
  if (year < kFirstYear || year > kLastYear) return std::nullopt;
  return std::array<std::int32_t, 6>{year,
                                     static_cast<std::int32_t>(static_cast<unsigned>(date.month())),
                                     static_cast<std::int32_t>(static_cast<unsigned>(date.day())),
                                     left / 3600,
                                     left / 60 % 60,
                                     left % 60};
}

DateTime DateTime::plusDays(double days) const {
  DateTime sum = fromLinear(linear() + days);
  sum.status = status;
  return sum;
}

std::string dateTimeText(const DateTime& moment) {
  const auto parts = moment.parts();
  if (!parts) return "no date";
  const auto [year, month, day, hour, minute, second] = *parts;
  return fmt::format("{:04}-{:02}-{:02} {:02}:{:02}:{:02}", year, month, day, hour, minute, second);
}

std::optional<DateTime> dateTimeOfText(std::string_view text) {
  constexpr std::string_view kSeparators = "--T::";
  std::array<std::int32_t, 6> parts{0, 0, 0, 0, 0, 0};
  std::size_t count = 0;
  while (count < parts.size()) {
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), parts[count]);
    if (error != std::errc() || parts[count] < 0) return std::nullopt;
    text.remove_prefix(static_cast<std::size_t>(end - text.data()));
    ++count;
    if (text.empty() || count == parts.size()) break;
    const char separator = kSeparators[count - 1];
    if (text.front() != separator && !(separator == 'T' && text.front() == ' ')) return std::nullopt;
    text.remove_prefix(1);
  }
  if (!text.empty() || (count != 3 && count < 5)) return std::nullopt;
  const DateTime moment = DateTime::of(parts);
  return moment.valid() ? std::optional(moment) : std::nullopt;
}

}  // namespace gridbay
