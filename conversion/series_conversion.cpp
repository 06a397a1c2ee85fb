#include "conversion/series_conversion.h"

#include <fmt/format.h>

#include <cmath>
#include <filesystem>
#include <string_view>
#include <vector>

#include "conversion/history.h"
#include "conversion/item_types.h"
#include "conversion/moments.h"
#include "core/date_time.h"
#include "core/number_text.h"
#include "platform/files/may_write.h"
#include "platform/files/read_file.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

// How far times may be off an even step and still count as one, in parts of the step.
constexpr double kEvenTolerance = 1e-3;

struct Table {
  std::vector<std::string> names;
  std::vector<double> times;
  std::vector<std::vector<double>> columns;
};

// Fields between commas, semicolons or tabs, or else between blanks (in a heading two at least, as its words
// have single ones).
std::vector<std::string_view> fieldsOf(std::string_view line, std::size_t leastBlanks) {
  const char separator = line.find_first_of(",;\t") == line.npos ? ' ' : line[line.find_first_of(",;\t")];
  std::vector<std::string_view> fields;
  const auto trim = [](std::string_view text) {
    const std::size_t first = text.find_first_not_of(" \r\t");
    if (first == text.npos) return std::string_view();
    return text.substr(first, text.find_last_not_of(" \r\t") - first + 1);
  };
  if (separator != ' ') {
    for (std::size_t start = 0; start <= line.size();) {
      const std::size_t end = std::min(line.find(separator, start), line.size());
      fields.push_back(trim(line.substr(start, end - start)));
      start = end + 1;
    }
    return fields;
  }
  const std::string gap(leastBlanks, ' ');
  for (line = trim(line); !line.empty();) {
    const std::size_t end = std::min(line.find(gap), line.size());
    fields.push_back(line.substr(0, end));
    line = trim(line.substr(end));
  }
  return fields;
}

Result<Table> readTable(const SeriesConversion& options, const ConversionHost& host) {
  const Result<FileText> text = readFile(options.in);
  if (!text) return Failure{text.error()};
  const auto fail = [&](int line, const std::string& why) {
    return Failure{fmt::format("cannot read \"{}\": line {}: {}", options.in, line, why)};
  };
  Table table;
  std::string_view heading;
  std::string_view rest = text->view();
  for (int number = 1; !rest.empty(); ++number) {
    const std::size_t end = std::min(rest.find('\n'), rest.size());
    const std::string_view line = rest.substr(0, end);
    rest.remove_prefix(std::min(end + 1, rest.size()));
    if (number <= options.skipLines) {
      heading = line;
      continue;
    }
    const std::vector<std::string_view> fields = fieldsOf(line, 1);
    if (fields.empty() || (fields.size() == 1 && fields[0].empty())) continue;
    if (fields.size() < 2) return fail(number, "a time and at least one value are expected");
    if (table.columns.empty()) table.columns.resize(fields.size() - 1);
    if (fields.size() != table.columns.size() + 1) {
      return fail(number, fmt::format("{} fields, where the lines before have {}", fields.size(),
                                      table.columns.size() + 1));
    }
    for (std::size_t i = 0; i < fields.size(); ++i) {
      const std::optional<double> value = doubleOfText(fields[i]);
      if (!value) {
        const std::string hint = table.times.empty()
                                     ? fmt::format(" (are there heading lines? {} passes over them)",
                                                   host.option("skip-lines", "N"))
                                     : "";
        return fail(number, fmt::format("\"{}\" is no number{}", fields[i], hint));
      }
      if (!std::isfinite(*value)) {
        return fail(number,
                    i == 0 ? fmt::format("\"{}\" is no moment", fields[i])
                           : fmt::format("\"{}\" is no value that can stand in a series; leave out lines "
                                         "without a value",
                                         fields[i]));
      }
      (i == 0 ? table.times : table.columns[i - 1]).push_back(*value);
    }
    if (table.times.size() > 1 && !(table.times.back() > table.times[table.times.size() - 2])) {
      return fail(number, "the time does not rise");
    }
  }
  if (table.times.empty()) return Failure{fmt::format("cannot read \"{}\": there are no values", options.in)};
  const std::vector<std::string_view> names = fieldsOf(heading, 2);
  if (names.size() == table.columns.size() + 1) table.names.assign(names.begin() + 1, names.end());
  return table;
}

TsbTimeAxis timeAxisOf(const Table& table, const SeriesConversion& options, const DateTime& start) {
  TsbTimeAxis axis;
  axis.start = *start.parts();
  axis.unit = options.timeUnit;
  axis.count = table.times.size();
  axis.first = table.times.front();
  const auto intervals = static_cast<double>(axis.count - 1);
  // The mean step may have picked up the last digit of a time; a step of few digits that fits as well is
  // meant.
  axis.step = axis.count > 1 ? (table.times.back() - table.times.front()) / intervals : 1;
  const double plain = doubleOfText(fmt::format("{:.6g}", axis.step)).value_or(axis.step);
  if (std::abs(plain - axis.step) * intervals <= kEvenTolerance * axis.step) axis.step = plain;
  for (std::size_t i = 0; i < axis.count; ++i) {
    if (std::abs(table.times[i] - axis.at(i)) <= kEvenTolerance * axis.step) continue;
    axis.type = TsbTimeAxisType::calendar;
    axis.values = table.times;
    break;
  }
  return axis;
}

}  // namespace

Result<ConvertedSeries> convertSeries(const SeriesConversion& options, ConversionHost& host) {
  if (const Outcome free = mayWrite(options.out, options.force, {&options.in, 1}, host.option("force"));
      !free)
    return Failure{free.error()};
  if (options.itemTypes.empty()) return Failure{fmt::format("{} is missing", host.option("item-type"))};
  if (options.skipLines < 0) {
    return Failure{
        fmt::format("{} cannot be {}: it is at least 0", host.option("skip-lines"), options.skipLines)};
  }
  std::vector<const QunItem*> quantities;
  for (const std::string& text : options.itemTypes) {
    const Result<const QunItem*> found = itemTypeOfText(text, host.itemTypeList());
    if (!found) return Failure{found.error()};
    quantities.push_back(*found);
  }
  const std::optional<DateTime> start = dateTimeOfText(options.start);
  if (!start)
    return Failure{fmt::format("\"{}\" is no moment of the form YYYY-MM-DD hh:mm:ss", options.start)};
  if (!qunAreEquivalent(options.timeUnit, "s")) {
    return Failure{fmt::format("\"{}\" is no unit of time (s, min, h, d)", options.timeUnit)};
  }
  const Result<Table> table = readTable(options, host);
  if (!table) return Failure{table.error()};

  if (quantities.size() > 1 && quantities.size() != table->columns.size()) {
    return Failure{
        fmt::format("There are {} item types for {} columns of values: give one for all, or "
                    "one for each",
                    quantities.size(), table->columns.size())};
  }

  TsbDefinition definition;
  definition.title = std::filesystem::path(options.in).stem().string();
  definition.history = historyWith({}, options.history);
  definition.time = timeAxisOf(*table, options, *start);
  const std::string first = momentText(definition.time, 0);
  const std::string last = momentText(definition.time, definition.time.count - 1);
  if (first.empty() || last.empty()) {
    return Failure{fmt::format("The times of \"{}\" ({:g} to {:g} {}) lead out of the calendar", options.in,
                               table->times.front(), table->times.back(), options.timeUnit)};
  }
  for (std::size_t i = 0; i < table->columns.size(); ++i) {
    const QunItem* quantity = quantities.size() > 1 ? quantities[i] : quantities.front();
    std::string name = i < table->names.size() ? table->names[i] : std::string(quantity->name);
    if (table->names.empty() && table->columns.size() > quantities.size()) name += fmt::format(" {}", i + 1);
    definition.items.push_back(
        {std::move(name), quantity->code, std::string(qunBaseUnit(quantity->code)->text), true});
  }
  Result<TsbWriter> writer = TsbWriter::create(options.out, definition);
  if (!writer) return Failure{writer.error()};
  const std::size_t total = table->columns.size() * table->times.size();
  for (std::size_t i = 0; i < table->columns.size(); ++i) {
    for (std::size_t step = 0; step < table->times.size(); ++step) {
      const std::span<const double> value(&table->columns[i][step], 1);
      if (const Outcome written = writer->write(i + 1, step, value); !written)
        return Failure{written.error()};
      if (!host.reached(i * table->times.size() + step + 1, total))
        return Failure{std::string(kConversionStopped)};
    }
  }
  if (const Outcome written = writer->commit(); !written) return Failure{written.error()};
  const bool even = definition.time.isEquidistant();
  ConvertedSeries converted{.items = {},
                            .steps = definition.time.count,
                            .equidistant = even,
                            .first = first,
                            .last = last,
                            .summary = {}};
  for (const TsbItem& item : definition.items) converted.items.push_back(item.name);
  converted.summary =
      fmt::format("{}: {} of {} time step{}{} from {} to {}\n", options.out, definition.items.front().name,
                  definition.time.count, definition.time.count == 1 ? "" : "s",
                  even && definition.time.count > 1
                      ? fmt::format(", {:g} {} apart,", definition.time.step, options.timeUnit)
                      : "",
                  first, last);
  return converted;
}

}  // namespace gridbay
