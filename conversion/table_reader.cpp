#include "conversion/table_reader.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

#include "core/nearest.h"
#include "core/number_text.h"

namespace gridbay {
namespace {

using Role = TableColumn::Role;

constexpr double kSecondsPerDay = 86400;
constexpr std::string_view kBlanks = " \r\t";

std::string_view withoutBlanks(std::string_view text) {
  const std::size_t first = text.find_first_not_of(kBlanks);
  if (first == text.npos) return {};
  return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

std::string_view unquoted(std::string_view text) {
  text = withoutBlanks(text);
  const bool isQuoted = text.size() > 1 && text.front() == '"' && text.back() == '"';
  return isQuoted ? withoutBlanks(text.substr(1, text.size() - 2)) : text;
}

// One line's way to its row.
class RowReader {
 public:
  RowReader(std::string_view line, const TableForm& form)
      : form_(form), fields_(tableFields(line, form.separator)) {}

  TableRow read() {
    const std::size_t count = form_.columns.size();
    if (fields_.size() != count) {
      row_.fault = fmt::format("{} fields, where the lines before have {}", fields_.size(), count);
      return std::move(row_);
    }
    for (std::size_t i = 0; i < count && row_.fault.empty(); ++i) take(i);
    return std::move(row_);
  }

 private:
  void fail(std::size_t column, std::string why) {
    row_.fault = std::move(why);
    row_.faultyColumn = static_cast<int>(column);
  }

  void take(std::size_t i) {
    const std::string_view text = fields_[i];
    switch (form_.columns[i].role) {
      case Role::item:
        return takeValue(i, text);
      case Role::date:
        return takeDate(i, text);
      case Role::clock:
        if (const std::optional<double> seconds = writtenClock(text)) {
          row_.time += *seconds;
          return;
        }
        return fail(i, fmt::format("\"{}\" is no time of day", text));
      case Role::dayNumber:
      case Role::time:
        return takeTime(i, text);
      case Role::leftOut:
        return;
    }
  }

  void takeDate(std::size_t i, std::string_view text) {
    const std::optional<WrittenDate> date = writtenDate(text);
    const std::optional<double> day = date ? dayOf(*date, form_.dateOrder) : std::nullopt;
    if (!day) return fail(i, fmt::format("\"{}\" is no date", text));
    row_.time += *day * kSecondsPerDay + date->seconds;
  }

  void takeTime(std::size_t i, std::string_view text) {
    const std::optional<double> number = tableNumber(text, form_.decimalComma);
    if (!number) return fail(i, fmt::format("\"{}\" is no number", text));
    if (!std::isfinite(*number)) return fail(i, fmt::format("\"{}\" is no moment", text));
    // Spreadsheets write too few digits for parts of a second.
    const bool isDay = form_.columns[i].role == Role::dayNumber;
    row_.time += isDay ? std::round(*number * kSecondsPerDay) : *number;
  }

  void takeValue(std::size_t i, std::string_view text) {
    const std::optional<double> number = tableNumber(text, form_.decimalComma);
    const bool isValue = number && std::isfinite(*number);
    const bool isMissing =
        isValue ? std::ranges::find(form_.missing, *number) != form_.missing.end() : isMissingText(text);
    if (isMissing && form_.takesMissing) {
      row_.values.push_back(std::numeric_limits<double>::quiet_NaN());
    } else if (isValue) {
      row_.values.push_back(*number);
    } else if (number) {
      fail(i, fmt::format("\"{}\" is no value that can stand in a series; leave out lines without a value",
                          text));
    } else {
      fail(i, fmt::format("\"{}\" is no number", text));
    }
  }

  const TableForm& form_;
  std::vector<std::string_view> fields_;
  TableRow row_;
};

}  // namespace

bool TableForm::hasRole(TableColumn::Role role) const {
  return std::ranges::any_of(columns, [role](const TableColumn& column) { return column.role == role; });
}

bool isBlankLine(std::string_view line) {
  return line.find_first_not_of(kBlanks) == line.npos;
}

std::vector<std::string_view> tableFields(std::string_view line, char separator, std::size_t leastBlanks) {
  std::vector<std::string_view> fields;
  if (separator == ' ') {
    const std::string gap(leastBlanks, ' ');
    for (line = withoutBlanks(line); !line.empty();) {
      const std::size_t end = std::min(line.find(gap), line.size());
      fields.push_back(unquoted(line.substr(0, end)));
      line = withoutBlanks(line.substr(end));
    }
    return fields;
  }
  while (!line.empty() && line.back() == '\r') line.remove_suffix(1);
  bool isInQuotes = false;
  std::size_t start = 0;
  for (std::size_t i = 0; i <= line.size(); ++i) {
    if (i < line.size() && line[i] == '"') isInQuotes = !isInQuotes;
    if (i < line.size() && (isInQuotes || line[i] != separator)) continue;
    fields.push_back(unquoted(line.substr(start, i - start)));
    start = i + 1;
  }
  return fields;
}

namespace {

// "1.150", "-12.345.678"
bool hasThousandsPoints(std::string_view text) {
  if (text.starts_with('-') || text.starts_with('+')) text.remove_prefix(1);
  std::size_t digits = 0;
  std::size_t groups = 0;
  for (const char c : text) {
    const bool isPoint = c == '.';
    if (!isPoint && (c < '0' || c > '9')) return false;
    if (isPoint && (groups == 0 ? digits < 1 || digits > 3 : digits != 3)) return false;
    digits = isPoint ? 0 : digits + 1;
    if (isPoint) ++groups;
  }
  return groups > 0 && digits == 3 && text.front() != '0';
}

}  // namespace

std::optional<double> tableNumber(std::string_view text, bool decimalComma) {
  if (!decimalComma) return doubleOfText(text);
  // Points and blanks stand between thousands then.
  if (text.find(',') == text.npos && !hasThousandsPoints(text)) return doubleOfText(text);
  if (text.rfind('.') != text.npos && text.rfind('.') > text.find(',')) return std::nullopt;
  std::string plain;
  for (const char c : text) {
    if (c != '.' && c != ' ' && c != '\'') plain += c == ',' ? '.' : c;
  }
  return doubleOfText(plain);
}

bool isMissingText(std::string_view text) {
  constexpr std::array<std::string_view, 9> kWords{"nan",  "na",  "n/a",     "#n/a", "null",
                                                   "none", "nil", "missing", "*"};
  if (text.find_first_not_of('-') == text.npos) return true;
  return std::ranges::find(kWords, lowered(text)) != kWords.end();
}

TableRow readTableRow(std::string_view line, const TableForm& form) {
  return RowReader(line, form).read();
}

}  // namespace gridbay
