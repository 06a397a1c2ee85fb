#pragma once

#include <array>
#include <optional>
#include <string_view>

namespace gridbay {

// The order of the numbers in a date.
enum class DateOrder { yearMonthDay, dayMonthYear, monthDayYear };

// A date as it is written, with or without a time of day.
struct WrittenDate {
  std::array<int, 3> parts{};  // in the order that they stand
  int namedPart = -1;          // the one that is the name of a month
  bool yearIsFirst = false;    // by its four digits
  char separator = '-';        // between them; 0 where there is none, as in 20200131
  double seconds = 0;          // of the day
  bool hasTime = false;
  bool hasOffset = false;  // from UTC, other than none
};

// Takes "2020-01-31", "31.1.2020", "1/31/20", "31-Jan-2020" and "20200131", each alone or with a time of day
// behind a blank or T: "06:00", "06:00:30.5", "6:00 PM", "0600", with "Z" or an offset behind.
std::optional<WrittenDate> writtenDate(std::string_view text);
// The time of day alone, in seconds; it needs a colon.
std::optional<double> writtenClock(std::string_view text);

// Days since 1899-12-30, whole ones; nothing for a date that there is not. The order counts where neither
// four digits nor a name tell it.
std::optional<double> dayOf(const WrittenDate& date, DateOrder order);

}  // namespace gridbay
