#include "conversion/table_guess.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <map>
#include <optional>

#include "conversion/table_headings.h"
#include "core/nearest.h"
#include "core/number_text.h"

namespace gridbay {
namespace {

using Role = TableColumn::Role;

constexpr std::size_t kMostLines = 50'000;
constexpr std::size_t kSampleLines = 60;
constexpr std::size_t kMostFields = 500;

// What a field looks like.
enum class Kind { missing, number, date, clock, text };

Kind kindOf(std::string_view field) {
  if (isMissingText(field)) return Kind::missing;
  if (tableNumber(field, false) || tableNumber(field, true)) return Kind::number;
  if (writtenDate(field)) return Kind::date;
  return writtenClock(field) ? Kind::clock : Kind::text;
}

std::vector<std::string_view> linesOf(std::string_view text) {
  std::vector<std::string_view> lines;
  while (!text.empty() && lines.size() < kMostLines) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    lines.push_back(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  return lines;
}

class Guesser {
 public:
  Guesser(std::string_view text, char separator, int headerLines)
      : lines_(linesOf(text)), isHeaderGiven_(headerLines >= 0) {
    form_.headerLines = std::max(headerLines, 0);
    takeSample();
    if (sample_.empty()) return;
    form_.separator = separator != 0 ? separator : likeliestSeparator();
    countColumns();
    if (kinds_.size() < 2) return;
    if (!isHeaderGiven_) countHeaderLines();
    form_.columns.resize(kinds_.size());
    nameColumns();
    guessNumbers();
    giveRoles();
    guessTimes();
    guessDateOrder();
    guessMissing();
    guessItems();
  }

  TableGuess result() {
    return {std::move(form_), std::move(doubts_), std::move(missingDoubts_), std::move(dateOrderDoubt_)};
  }

 private:
  // The later ones of the first lines, where no heading stands any more.
  void takeSample() {
    const std::size_t header = static_cast<std::size_t>(form_.headerLines);
    for (std::size_t i = header; i < lines_.size() && sample_.size() < 3 * kSampleLines; ++i) {
      if (!isBlankLine(lines_[i])) sample_.push_back(lines_[i]);
    }
    if (sample_.size() > kSampleLines)
      sample_.erase(sample_.begin(), sample_.end() - static_cast<std::ptrdiff_t>(kSampleLines));
  }

  std::size_t usualCount(char separator) const {
    std::map<std::size_t, int> counts;
    for (const std::string_view line : sample_) ++counts[tableFields(line, separator).size()];
    return std::ranges::max_element(counts, {}, [](const auto& entry) { return entry.second; })->first;
  }

  char likeliestSeparator() const {
    char best = ',';
    double most = 0;
    for (const char separator : {'\t', ';', ',', ' '}) {
      const std::size_t count = usualCount(separator);
      if (count < 2 || count > kMostFields) continue;
      double score = 0;
      for (const std::string_view line : sample_) {
        const std::vector<std::string_view> fields = tableFields(line, separator);
        if (fields.size() != count) continue;
        const auto read =
            std::ranges::count_if(fields, [](std::string_view field) { return kindOf(field) != Kind::text; });
        score += static_cast<double>(read) / static_cast<double>(count);
      }
      if (score <= most) continue;
      most = score;
      best = separator;
    }
    return best;
  }

  // The kind that most fields of each column have.
  void countColumns() {
    const std::size_t count = usualCount(form_.separator);
    if (count > kMostFields) return;
    std::vector<std::map<Kind, int>> seen(count);
    for (const std::string_view line : sample_) {
      const std::vector<std::string_view> fields = tableFields(line, form_.separator);
      for (std::size_t i = 0; fields.size() == count && i < count; ++i) {
        if (const Kind kind = kindOf(fields[i]); kind != Kind::missing) ++seen[i][kind];
      }
    }
    for (const std::map<Kind, int>& kinds : seen) {
      const auto most = std::ranges::max_element(kinds, {}, [](const auto& entry) { return entry.second; });
      kinds_.push_back(most == kinds.end() ? Kind::missing : most->first);
    }
    const auto isOf = [](Kind kind) { return kind == Kind::number || kind == Kind::date; };
    if (std::ranges::none_of(kinds_, isOf)) kinds_.clear();
  }

  bool isOfTable(std::string_view line) const {
    const std::vector<std::string_view> fields = tableFields(line, form_.separator);
    if (fields.size() != kinds_.size()) return false;
    bool hasValue = false;
    for (std::size_t i = 0; i < fields.size(); ++i) {
      const Kind kind = kindOf(fields[i]);
      if (kind == Kind::missing || kinds_[i] == Kind::text) continue;
      if (kind != kinds_[i]) return false;
      hasValue = true;
    }
    return hasValue;
  }

  void countHeaderLines() {
    const auto first =
        std::ranges::find_if(lines_, [this](std::string_view line) { return isOfTable(line); });
    form_.headerLines = first == lines_.end() ? 0 : static_cast<int>(first - lines_.begin());
  }

  void nameColumns() {
    const std::vector<std::string_view> heading(
        lines_.begin(), lines_.begin() + std::min<std::ptrdiff_t>(
                                             form_.headerLines, static_cast<std::ptrdiff_t>(lines_.size())));
    const std::vector<ColumnHeading> headings = columnHeadings(heading, form_.separator, kinds_.size());
    for (std::size_t i = 0; i < form_.columns.size(); ++i) {
      form_.columns[i].name = headings[i].name;
      units_.push_back(headings[i].unit);
    }
  }

  // Calls with the fields of each line of values; false ends it.
  template <class Use>
  void eachRow(Use use) const {
    for (std::size_t i = static_cast<std::size_t>(form_.headerLines); i < lines_.size(); ++i) {
      const std::vector<std::string_view> fields = tableFields(lines_[i], form_.separator);
      if (fields.size() == kinds_.size() && !use(fields)) return;
    }
  }

  void guessNumbers() {
    bool mayBeThousands = true;
    std::string example;
    eachRow([&](const std::vector<std::string_view>& fields) {
      for (std::size_t i = 0; i < fields.size(); ++i) {
        const std::size_t comma = fields[i].find(',');
        if (kinds_[i] != Kind::number || comma == std::string_view::npos || !tableNumber(fields[i], true))
          continue;
        if (example.empty()) example = fields[i];
        const bool hasZero = fields[i].starts_with("0") || fields[i].starts_with("-0");
        if (fields[i].size() - comma != 4 || hasZero) mayBeThousands = false;
      }
      return mayBeThousands || example.empty();
    });
    form_.decimalComma = !example.empty();
    if (form_.decimalComma && mayBeThousands)
      doubts_.push_back(
          fmt::format("The comma in \"{}\" may part thousands; it is taken for the decimal one", example));
  }

  void giveRoles() {
    const auto first = [this](Kind kind) {
      return static_cast<std::size_t>(std::ranges::find(kinds_, kind) - kinds_.begin());
    };
    const std::size_t date = first(Kind::date);
    const std::size_t clock = first(Kind::clock);
    for (std::size_t i = 0; i < kinds_.size(); ++i) {
      form_.columns[i].role =
          kinds_[i] == Kind::number || kinds_[i] == Kind::missing ? Role::item : Role::leftOut;
    }
    if (date < kinds_.size()) {
      form_.columns[date].role = Role::date;
      bool hasTime = false;
      eachRow([&](const std::vector<std::string_view>& fields) {
        const std::optional<WrittenDate> written = writtenDate(fields[date]);
        hasTime = hasTime || (written && written->hasTime);
        return !hasTime;
      });
      if (clock < kinds_.size() && !hasTime) form_.columns[clock].role = Role::clock;
      return;
    }
    if (kinds_.front() == Kind::number) giveNumericTime();
  }

  // A first column of numbers that rise: dates without separators, days of a spreadsheet, or times.
  void giveNumericTime() {
    std::vector<double> times;
    bool areDates = true;
    bool rises = true;
    eachRow([&](const std::vector<std::string_view>& fields) {
      const std::optional<double> number = tableNumber(fields[0], form_.decimalComma);
      if (!number) return true;
      rises = rises && (times.empty() || *number > times.back());
      const std::optional<WrittenDate> date = writtenDate(fields[0]);
      areDates = areDates && date && dayOf(*date, DateOrder::yearMonthDay);
      times.push_back(*number);
      return rises;
    });
    if (!rises || times.empty()) return;
    TableColumn& column = form_.columns.front();
    const std::string unit = timeUnitOfHeading(column.name, units_.front());
    constexpr double kFirstDay = 18264;  // 1950-01-01
    constexpr double kLastDay = 73051;   // 2100-01-01
    const bool isDay = unit.empty() && times.front() >= kFirstDay && times.back() < kLastDay;
    const bool isWhole = std::ranges::all_of(times, [](double time) { return time == std::floor(time); });
    const bool isDaily = times.size() > 1 && times[1] - times[0] == 1;
    if (areDates) {
      column.role = Role::date;
    } else if (isDay && (!isWhole || isDaily)) {
      column.role = Role::dayNumber;
      doubts_.push_back(
          fmt::format("\"{}\" is taken for days since 1899-12-30, as spreadsheets count", column.name));
    } else {
      column.role = Role::time;
      form_.timeUnit = unit.empty() ? "s" : unit;
      if (unit.empty())
        doubts_.push_back(
            fmt::format("The table does not tell the unit of \"{}\": seconds are meant", column.name));
    }
  }

  void guessTimes() {
    const bool hasTime =
        form_.hasRole(Role::date) || form_.hasRole(Role::dayNumber) || form_.hasRole(Role::time);
    if (!hasTime) doubts_.emplace_back("No column of times was found: say which one holds them");
    if (form_.hasRole(Role::time)) doubts_.emplace_back("The table does not tell the moment of time 0");
  }

  void guessDateOrder() {
    const auto at = std::ranges::find(form_.columns, Role::date, &TableColumn::role);
    if (at == form_.columns.end()) return;
    const auto column = static_cast<std::size_t>(at - form_.columns.begin());
    std::optional<WrittenDate> open;  // one whose order is not seen
    std::string example;
    int highestFirst = 0;
    int highestSecond = 0;
    int highestThird = 0;
    int leastFirst = std::numeric_limits<int>::max();
    int leastThird = leastFirst;
    bool hasOffset = false;
    eachRow([&](const std::vector<std::string_view>& fields) {
      const std::optional<WrittenDate> date = writtenDate(fields[column]);
      if (!date) return true;
      hasOffset = hasOffset || date->hasOffset;
      if (date->yearIsFirst || date->namedPart >= 0) return true;
      if (!open) example = fields[column];
      if (!open) open = date;
      highestFirst = std::max(highestFirst, date->parts[0]);
      highestSecond = std::max(highestSecond, date->parts[1]);
      highestThird = std::max(highestThird, date->parts[2]);
      leastFirst = std::min(leastFirst, date->parts[0]);
      leastThird = std::min(leastThird, date->parts[2]);
      return true;
    });
    if (hasOffset)
      doubts_.emplace_back(
          "The times tell how far they are off UTC: that is passed over, they stand as they are");
    if (!open) return;
    constexpr int kMonths = 12;
    constexpr int kDays = 31;
    if (highestFirst > kDays) return;  // a year of two digits
    form_.dateOrder = highestSecond > kMonths ? DateOrder::monthDayYear : DateOrder::dayMonthYear;
    // With years of two digits the last part may be the day.
    if (highestThird <= kDays && highestSecond <= kMonths && open->separator == '-' &&
        rises(column, DateOrder::yearMonthDay)) {
      const bool isYearFirst = !rises(column, DateOrder::dayMonthYear) ||
                               (leastFirst == highestFirst && leastThird < highestThird);
      if (isYearFirst) form_.dateOrder = DateOrder::yearMonthDay;
      dateOrderDoubt_ = fmt::format("Dates such as \"{}\" may have the year first or last: the {} is meant",
                                    example, isYearFirst ? "first" : "last");
      return;
    }
    if (highestFirst > kMonths || highestSecond > kMonths) return;
    const bool risesByDay = rises(column, DateOrder::dayMonthYear);
    const bool risesByMonth = rises(column, DateOrder::monthDayYear);
    if (risesByMonth && !risesByDay) form_.dateOrder = DateOrder::monthDayYear;
    if (risesByMonth != risesByDay || open->separator == '.') return;
    dateOrderDoubt_ = fmt::format(
        "Dates such as \"{}\" may be day/month/year or month/day/year: the first is meant", example);
  }

  bool rises(std::size_t column, DateOrder order) const {
    double last = -1e300;
    bool rising = true;
    eachRow([&](const std::vector<std::string_view>& fields) {
      const std::optional<WrittenDate> date = writtenDate(fields[column]);
      const std::optional<double> day = date ? dayOf(*date, order) : std::nullopt;
      if (!day) return true;
      rising = *day >= last;
      last = *day;
      return rising;
    });
    return rising;
  }

  void guessMissing() {
    constexpr std::array<double, 8> kNumbers{-9999, -999, -99999, -999.9, -999.99, -9999.9, -1e-35, 1e35};
    std::map<double, int> found;
    eachRow([&](const std::vector<std::string_view>& fields) {
      for (std::size_t i = 0; i < fields.size(); ++i) {
        if (form_.columns[i].role != Role::item) continue;
        const std::optional<double> number = tableNumber(fields[i], form_.decimalComma);
        if (number && std::ranges::find(kNumbers, *number) != kNumbers.end()) ++found[*number];
      }
      return true;
    });
    for (const auto& [number, count] : found) {
      form_.missing.push_back(number);
      missingDoubts_.push_back(fmt::format("{:g} stands {} for a value: it is taken for a missing one",
                                           number, count == 1 ? "once" : fmt::format("{} times", count)));
    }
  }

  void guessItems() {
    for (std::size_t i = 0; i < form_.columns.size(); ++i) {
      TableColumn& column = form_.columns[i];
      if (column.role != Role::item) continue;
      column.unit = unitOfHeading(units_[i]);
      column.itemType = itemTypeOfHeading(column.name, column.unit);
      if (!units_[i].empty() && column.unit.empty() && units_[i] != "-")
        doubts_.push_back(fmt::format("\"{}\" of \"{}\" is no unit that is known", units_[i], column.name));
    }
  }

  TableForm form_;
  std::vector<std::string> doubts_;
  std::vector<std::string> missingDoubts_;
  std::string dateOrderDoubt_;
  std::vector<std::string_view> lines_;
  std::vector<std::string_view> sample_;
  std::vector<Kind> kinds_;
  std::vector<std::string> units_;  // as the heading has them
  bool isHeaderGiven_;
};

}  // namespace

TableGuess guessTable(std::string_view text) {
  return guessTable(text, 0, -1);
}

TableGuess guessTable(std::string_view text, char separator, int headerLines) {
  return Guesser(text, separator, headerLines).result();
}

}  // namespace gridbay
