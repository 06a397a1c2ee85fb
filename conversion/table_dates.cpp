#include "conversion/table_dates.h"

#include <algorithm>
#include <charconv>
#include <string>

#include "core/date_time.h"
#include "core/nearest.h"

namespace gridbay {
namespace {

constexpr double kDay = 86400;

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}
bool isLetter(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

std::string_view takeWhile(std::string_view& text, bool (*belongs)(char)) {
  const auto end = std::ranges::find_if_not(text, belongs);
  const std::string_view taken = text.substr(0, static_cast<std::size_t>(end - text.begin()));
  text.remove_prefix(taken.size());
  return taken;
}

void skipBlanks(std::string_view& text) {
  takeWhile(text, [](char c) { return c == ' '; });
}

int numberOf(std::string_view digits) {
  int number = -1;
  std::from_chars(digits.data(), digits.data() + digits.size(), number);
  return number;
}

// 1 to 12 for the English name of a month or its first three letters; 0 for none.
int monthOf(std::string_view word) {
  constexpr std::array<std::string_view, 12> kMonths{"january",   "february", "march",    "april",
                                                     "may",       "june",     "july",     "august",
                                                     "september", "october",  "november", "december"};
  const std::string name = lowered(word);
  for (std::size_t i = 0; i < kMonths.size() && name.size() >= 3; ++i) {
    if (kMonths[i].starts_with(name)) return static_cast<int>(i) + 1;
  }
  return 0;
}

// Hours, minutes and seconds, and what follows them up to the end.
std::optional<double> takeClock(std::string_view text, bool needsColon, bool* hasOffset) {
  const std::string_view first = takeWhile(text, isDigit);
  if (first.empty() || first.size() > 6) return std::nullopt;
  std::array<int, 3> parts{numberOf(first), 0, 0};
  double fraction = 0;
  if (!text.empty() && text.front() == ':') {
    for (std::size_t i = 1; i < 3 && !text.empty() && text.front() == ':'; ++i) {
      text.remove_prefix(1);
      const std::string_view digits = takeWhile(text, isDigit);
      if (digits.empty() || digits.size() > 2) return std::nullopt;
      parts[i] = numberOf(digits);
    }
    if (!text.empty() && (text.front() == '.' || text.front() == ',')) {
      text.remove_prefix(1);
      double place = 1;
      for (const char digit : takeWhile(text, isDigit)) fraction += (digit - '0') * (place /= 10);
    }
  } else if (!needsColon && (first.size() == 4 || first.size() == 6)) {
    parts = {numberOf(first.substr(0, 2)), numberOf(first.substr(2, 2)),
             first.size() == 6 ? numberOf(first.substr(4, 2)) : 0};
  } else {
    return std::nullopt;
  }
  skipBlanks(text);
  const std::string word = lowered(takeWhile(text, isLetter));
  if (word == "am" || word == "pm") {
    if (parts[0] < 1 || parts[0] > 12) return std::nullopt;
    parts[0] = parts[0] % 12 + (word == "pm" ? 12 : 0);
  } else if (!word.empty() && word != "z" && word != "utc") {
    return std::nullopt;
  }
  if (!text.empty() && (text.front() == '+' || text.front() == '-')) {
    text.remove_prefix(1);
    const std::string_view offset = text;
    takeWhile(text, [](char c) { return isDigit(c) || c == ':'; });
    if (offset.size() < 2) return std::nullopt;
    if (hasOffset != nullptr) *hasOffset = offset.find_first_of("123456789") != offset.npos;
  }
  if (!text.empty() || parts[1] > 59 || parts[2] > 59) return std::nullopt;
  const double seconds = parts[0] * 3600.0 + parts[1] * 60.0 + parts[2] + fraction;
  return seconds <= kDay ? std::optional(seconds) : std::nullopt;
}

// The date without what stands behind it.
std::optional<WrittenDate> takeDate(std::string_view& text) {
  WrittenDate date;
  const std::string_view start = text;
  if (const std::string_view digits = takeWhile(text, isDigit);
      digits.size() == 8 || digits.size() == 12 || digits.size() == 14) {
    date.parts = {numberOf(digits.substr(0, 4)), numberOf(digits.substr(4, 2)),
                  numberOf(digits.substr(6, 2))};
    date.yearIsFirst = true;
    date.separator = 0;
    // The time of day follows at once.
    if (digits.size() > 8) text = start.substr(8);
    constexpr int kFirstYear = 1800;
    constexpr int kLastYear = 2200;
    return date.parts[0] >= kFirstYear && date.parts[0] <= kLastYear ? std::optional(date) : std::nullopt;
  }
  text = start;
  for (int i = 0; i < 3; ++i) {
    if (i > 0) {
      if (text.empty() || std::string_view("-/. ").find(text.front()) == std::string_view::npos)
        return std::nullopt;
      if (i > 1 && text.front() != date.separator) return std::nullopt;
      date.separator = text.front();
      text.remove_prefix(1);
    }
    const auto at = static_cast<std::size_t>(i);
    const std::string_view digits = takeWhile(text, isDigit);
    if (digits.empty()) {
      date.parts[at] = monthOf(takeWhile(text, isLetter));
      if (date.parts[at] == 0 || date.namedPart >= 0) return std::nullopt;
      date.namedPart = i;
      continue;
    }
    if (digits.size() > 4 || digits.size() == 3) return std::nullopt;
    date.parts[at] = numberOf(digits);
    if (digits.size() == 4 && i == 0) date.yearIsFirst = true;
    if (digits.size() == 4 && i == 1) return std::nullopt;
  }
  // Three numbers between blanks may be anything.
  if (date.separator == ' ' && date.namedPart < 0) return std::nullopt;
  return date;
}

}  // namespace

std::optional<WrittenDate> writtenDate(std::string_view text) {
  std::optional<WrittenDate> date = takeDate(text);
  if (!date || text.empty()) return date;
  if (date->separator != 0 || !isDigit(text.front())) {
    if (text.front() != ' ' && text.front() != 'T') return std::nullopt;
    text.remove_prefix(1);
    skipBlanks(text);
  }
  const std::optional<double> seconds = takeClock(text, false, &date->hasOffset);
  if (!seconds) return std::nullopt;
  date->seconds = *seconds;
  date->hasTime = true;
  return date;
}

std::optional<double> writtenClock(std::string_view text) {
  return takeClock(text, true, nullptr);
}

std::optional<double> dayOf(const WrittenDate& date, DateOrder order) {
  std::array<int, 3> parts = date.parts;  // to become year, month, day
  const bool isMonthFirst = date.namedPart == 0 || (date.namedPart < 0 && order == DateOrder::monthDayYear);
  if (!date.yearIsFirst && (date.namedPart >= 0 || order != DateOrder::yearMonthDay)) {
    parts = {date.parts[2], date.parts[isMonthFirst ? 0 : 1], date.parts[isMonthFirst ? 1 : 0]};
  }
  constexpr int kCentury = 100;
  constexpr int kPivot = 70;  // two digits below it are of this century
  if (parts[0] < kCentury) parts[0] += parts[0] < kPivot ? 2000 : 1900;
  const DateTime day = DateTime::of({parts[0], parts[1], parts[2], 0, 0, 0});
  return day.valid() ? std::optional(day.linear()) : std::nullopt;
}

}  // namespace gridbay
