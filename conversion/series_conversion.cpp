#include "conversion/series_conversion.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <iterator>
#include <string_view>
#include <vector>

#include "conversion/item_types.h"
#include "conversion/table_guess.h"
#include "conversion/table_text.h"
#include "core/date_time.h"
#include "platform/files/may_write.h"
#include "platform/files/read_file.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Role = TableColumn::Role;

// The first that a line has; a blank where it has none.
char separatorIn(std::string_view line) {
  const std::size_t found = line.find_first_of(",;\t");
  return found == line.npos ? ' ' : line[found];
}

// Times and values with nothing else: the first line of values tells how many, and the heading names them.
TableForm plainForm(std::string_view text, const SeriesConversion& options) {
  TableForm form;
  form.headerLines = options.skipLines;
  form.start = options.start;
  form.timeUnit = options.timeUnit;
  form.takesMissing = !options.missing.empty();
  form.missing = options.missing;
  std::string_view heading;
  for (int number = 1; !text.empty(); ++number) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    const std::string_view line = text.substr(0, end);
    text.remove_prefix(std::min(end + 1, text.size()));
    if (number <= options.skipLines) {
      heading = line;
      continue;
    }
    if (isBlankLine(line)) continue;
    form.separator = separatorIn(line);
    form.columns.resize(tableFields(line, form.separator).size());
    break;
  }
  const std::vector<std::string_view> names = tableFields(heading, separatorIn(heading), 2);
  for (std::size_t i = 0; i < form.columns.size(); ++i) {
    form.columns[i].role = i == 0 ? Role::time : Role::item;
    if (names.size() == form.columns.size()) form.columns[i].name = names[i];
  }
  return form;
}

Result<TableForm> recognisedForm(std::string_view text, const SeriesConversion& options,
                                 ConversionHost& host) {
  TableGuess guess = guessTable(text, 0, options.skipLines > 0 ? options.skipLines : -1);
  if (guess.form.columns.empty())
    return Failure{fmt::format("cannot read \"{}\": no table of times and values is seen in it", options.in)};
  if (guess.form.hasRole(Role::time)) {
    return Failure{fmt::format("The times of \"{}\" are numbers: {} gives the moment of time 0", options.in,
                               host.option("start"))};
  }
  if (options.dateOrder) guess.form.dateOrder = *options.dateOrder;
  if (options.missing.empty()) {
    std::ranges::move(guess.missingDoubts, std::back_inserter(guess.doubts));
  } else {
    guess.form.missing = options.missing;
  }
  if (!options.dateOrder && !guess.dateOrderDoubt.empty()) guess.doubts.push_back(guess.dateOrderDoubt);
  for (const std::string& doubt : guess.doubts) host.note(doubt);
  return guess.form;
}

// The item types that are given, one for all or one for each; else those that were recognised.
Outcome giveItemTypes(TableForm& form, const SeriesConversion& options, const ConversionHost& host) {
  std::vector<const QunItem*> quantities;
  for (const std::string& text : options.itemTypes) {
    const Result<const QunItem*> found = itemTypeOfText(text, host.itemTypeList());
    if (!found) return Failure{found.error()};
    quantities.push_back(*found);
  }
  const auto count =
      static_cast<std::size_t>(std::ranges::count(form.columns, Role::item, &TableColumn::role));
  if (quantities.size() > 1 && quantities.size() != count) {
    return Failure{
        fmt::format("There are {} item types for {} columns of values: give one for all, or "
                    "one for each",
                    quantities.size(), count)};
  }
  std::size_t number = 0;
  for (TableColumn& column : form.columns) {
    if (column.role != Role::item) continue;
    const QunItem* quantity = quantities.empty()       ? qunFindItem(column.itemType)
                              : quantities.size() == 1 ? quantities.front()
                                                       : quantities[number];
    ++number;
    if (quantity == nullptr) {
      return Failure{
          fmt::format("What \"{}\" holds is not seen from its name and unit: {} gives its item type",
                      column.name, host.option("item-type"))};
    }
    column.itemType = quantity->code;
    if (!column.name.empty()) continue;
    column.name = quantity->name;
    if (count > 1 && quantities.size() < count) column.name += fmt::format(" {}", number);
  }
  return {};
}

}  // namespace

const std::map<std::string, DateOrder>& dateOrderNames() {
  static const std::map<std::string, DateOrder> names{
      {"ymd", DateOrder::yearMonthDay}, {"dmy", DateOrder::dayMonthYear}, {"mdy", DateOrder::monthDayYear}};
  return names;
}

Result<ConvertedSeries> convertSeries(const SeriesConversion& options, ConversionHost& host) {
  if (const Outcome free = mayWrite(options.out, options.force, {&options.in, 1}, host.option("force"));
      !free)
    return Failure{free.error()};
  const bool isPlain = !options.start.empty();
  if (isPlain && options.itemTypes.empty())
    return Failure{fmt::format("{} is missing", host.option("item-type"))};
  if (options.skipLines < 0) {
    return Failure{
        fmt::format("{} cannot be {}: it is at least 0", host.option("skip-lines"), options.skipLines)};
  }
  for (const double number : options.missing) {
    if (!std::isfinite(number))
      return Failure{fmt::format("{} cannot be {}: it is a finite number", host.option("missing"), number)};
  }
  const Result<FileText> file = readFile(options.in);
  if (!file) return Failure{file.error()};
  const auto unread = [&options](std::string_view why) {
    return Failure{fmt::format("cannot read \"{}\": {}", options.in, why)};
  };
  const Result<std::string> text = tableText(file->view());
  if (!text) return unread(text.error());
  Result<TableForm> form = isPlain ? plainForm(*text, options) : recognisedForm(*text, options, host);
  if (!form) return Failure{form.error()};
  if (form->columns.empty()) return unread("there are no values");
  if (form->columns.size() == 1)
    return unread(fmt::format("line {}: a time and at least one value are expected", options.skipLines + 1));
  if (const std::string fault = faultOf(*form); !fault.empty()) return Failure{fault};
  if (const Outcome given = giveItemTypes(*form, options, host); !given) return Failure{given.error()};
  if (const std::string fault = faultOfItems(*form); !fault.empty()) return Failure{fault};
  const Result<SeriesTable> table = readSeriesTable(*text, *form);
  if (!table) return unread(table.error());
  if (table->faultCount > 0) {
    const auto& [line, text_, why] = table->faults.front();
    const bool mayBeHeading = isPlain && line <= static_cast<std::size_t>(options.skipLines) + 1;
    return unread(fmt::format(
        "line {}: {}{}", line, why,
        mayBeHeading && why.ends_with("is no number")
            ? fmt::format(" (are there heading lines? {} passes over them)", host.option("skip-lines", "N"))
            : ""));
  }
  return writeSeriesTable(*table,
                          {.out = options.out,
                           .title = std::filesystem::path(options.in).stem().string(),
                           .history = options.history},
                          host);
}

}  // namespace gridbay
