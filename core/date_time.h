#pragma once

#include <array>
#include <compare>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace gridbay {

// A date-time as a day number with a status. Day 0 is 1899-12-30 00:00; a negative day number holds its time
// of day as a positive fraction, so that -1.25 is 06:00 on 1899-12-29. Status 0 is valid, 1 is not.
struct DateTime {
  double day = 0;
  std::int32_t status = 0;

  // Year, month, day, hour, minute, second; status 1 when there is no such moment from year 100 to 9999.
  static DateTime of(std::array<std::int32_t, 6> parts);
  static DateTime invalid() { return {0, 1}; }
  static DateTime fromLinear(double days);

  bool valid() const { return status == 0; }
  // Days as one straight line, for differences and sums.
  double linear() const;
  // The parts, rounded to the second; nothing for an invalid date-time.
  std::optional<std::array<std::int32_t, 6>> parts() const;
  DateTime plusDays(double days) const;

  bool operator==(const DateTime&) const = default;
};

// "1993-07-12 13:17:00", or "no date" for an invalid one.
std::string dateTimeText(const DateTime& moment);
// Takes "YYYY-MM-DD hh:mm:ss", with "T" for the blank, and without seconds or time; else nothing.
std::optional<DateTime> dateTimeOfText(std::string_view text);

}  // namespace gridbay
