#include "conversion/series_table.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

#include "conversion/history.h"
#include "conversion/moments.h"
#include "core/date_time.h"
#include "core/number_text.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Role = TableColumn::Role;

// How far times may be off an even step and still count as one, in parts of the step.
constexpr double kEvenTolerance = 1e-3;
constexpr double kSecondsPerDay = 86400;

TsbTimeAxis timeAxisOf(const SeriesTable& table) {
  const std::vector<double>& times = table.times;
  TsbTimeAxis axis;
  axis.start = table.start;
  axis.unit = table.timeUnit;
  axis.count = times.size();
  axis.first = times.front();
  const auto intervals = static_cast<double>(axis.count - 1);
  // The mean step may have picked up the last digit of a time; a step of few digits that fits as well is
  // meant.
  axis.step = axis.count > 1 ? (times.back() - times.front()) / intervals : 1;
  const double plain = doubleOfText(fmt::format("{:.6g}", axis.step)).value_or(axis.step);
  if (std::abs(plain - axis.step) * intervals <= kEvenTolerance * axis.step) axis.step = plain;
  for (std::size_t i = 0; i < axis.count; ++i) {
    if (std::abs(times[i] - axis.at(i)) <= kEvenTolerance * axis.step) continue;
    axis.type = TsbTimeAxisType::calendar;
    axis.values = times;
    break;
  }
  return axis;
}

// Dates count from the whole second of the first one.
void countFromFirst(SeriesTable& table) {
  const double first = std::floor(table.times.front());
  table.start = DateTime::fromLinear(first / kSecondsPerDay).parts().value_or(table.start);
  constexpr double kThousandths = 1000;
  for (double& time : table.times) time = std::round((time - first) * kThousandths) / kThousandths;
}

class Reader {
 public:
  Reader(std::string_view text, const TableForm& form, const std::function<bool(double)>& reached)
      : rest_(text), size_(text.size()), form_(form), reached_(reached) {
    for (const TableColumn& column : form.columns) {
      if (column.role == Role::item) table_.items.push_back(column);
    }
    table_.values.resize(table_.items.size());
    table_.timeUnit = form.hasRole(Role::time) ? form.timeUnit : "s";
  }

  Result<SeriesTable> read() {
    constexpr std::size_t kLinesAtOnce = 4096;
    for (std::size_t number = 1; !rest_.empty(); ++number) {
      const std::size_t end = std::min(rest_.find('\n'), rest_.size());
      const std::string_view line = rest_.substr(0, end);
      rest_.remove_prefix(std::min(end + 1, rest_.size()));
      const bool isTold = reached_ && number % kLinesAtOnce == 0;
      if (isTold && !reached_(1 - static_cast<double>(rest_.size()) / static_cast<double>(size_)))
        return Failure{std::string(kConversionStopped)};
      if (number > static_cast<std::size_t>(form_.headerLines) && !isBlankLine(line)) take(line, number);
    }
    if (table_.times.empty() && table_.faults.empty()) return Failure{"there are no values"};
    if (table_.times.empty()) return std::move(table_);
    if (form_.hasRole(Role::time)) {
      table_.start = *dateTimeOfText(form_.start)->parts();
    } else {
      countFromFirst(table_);
    }
    return std::move(table_);
  }

 private:
  void take(std::string_view line, std::size_t number) {
    TableRow row = readTableRow(line, form_);
    if (row.fault.empty() && !table_.times.empty() && !(row.time > table_.times.back()))
      row.fault = "the time does not rise";
    if (row.fault.empty()) {
      table_.times.push_back(row.time);
      for (std::size_t i = 0; i < row.values.size(); ++i) table_.values[i].push_back(row.values[i]);
      return;
    }
    constexpr std::size_t kMostKept = 1000;
    ++table_.faultCount;
    if (table_.faults.size() < kMostKept)
      table_.faults.push_back({number, std::string(line), std::move(row.fault)});
  }

  std::string_view rest_;
  std::size_t size_;
  const TableForm& form_;
  const std::function<bool(double)>& reached_;
  SeriesTable table_;
};

TsbItem itemOf(const TableColumn& column) {
  return {column.name, column.itemType, std::string(qunBaseUnit(column.itemType)->text), true};
}

}  // namespace

std::string faultOf(const TableForm& form) {
  if (form.columns.size() < 2) return "A table of times and values is expected, line by line";
  const auto count = [&form](Role role) {
    return std::ranges::count(form.columns, role, &TableColumn::role);
  };
  const auto times = count(Role::date) + count(Role::dayNumber) + count(Role::time);
  if (times == 0) return "There is no column of times";
  if (times > 1 || count(Role::clock) > 1) return "There is more than one column of times";
  if (count(Role::clock) == 1 && count(Role::date) == 0) return "There is no date for the time of day";
  if (count(Role::item) == 0) return "There is no column of values";
  if (count(Role::time) == 0) return {};
  if (!dateTimeOfText(form.start))
    return fmt::format("\"{}\" is no moment of the form YYYY-MM-DD hh:mm:ss", form.start);
  if (!qunAreEquivalent(form.timeUnit, "s"))
    return fmt::format("\"{}\" is no unit of time (s, min, h, d)", form.timeUnit);
  return {};
}

std::string faultOfItems(const TableForm& form) {
  for (const TableColumn& column : form.columns) {
    if (column.role != Role::item) continue;
    const QunItem* quantity = qunFindItem(column.itemType);
    if (quantity == nullptr)
      return fmt::format("What \"{}\" holds is not known: it needs an item type", column.name);
    if (column.unit.empty() || qunAreEquivalent(column.unit, qunBaseUnit(quantity->code)->text)) continue;
    return fmt::format("\"{}\" is no unit of {}, the item type of \"{}\"", column.unit, quantity->name,
                       column.name);
  }
  return {};
}

Result<SeriesTable> readSeriesTable(std::string_view text, const TableForm& form,
                                    const std::function<bool(double)>& reached) {
  if (const std::string fault = faultOf(form); !fault.empty()) return Failure{fault};
  return Reader(text, form, reached).read();
}

Result<ConvertedSeries> writeSeriesTable(const SeriesTable& table, const SeriesTarget& target,
                                         ConversionHost& host) {
  TsbDefinition definition;
  definition.title = target.title;
  definition.history = historyWith({}, target.history);
  definition.time = timeAxisOf(table);
  const std::string first = momentText(definition.time, 0);
  const std::string last = momentText(definition.time, definition.time.count - 1);
  if (first.empty() || last.empty()) {
    return Failure{fmt::format("The times of \"{}\" ({:g} to {:g} {}) lead out of the calendar", target.title,
                               table.times.front(), table.times.back(), table.timeUnit)};
  }
  for (const TableColumn& column : table.items) definition.items.push_back(itemOf(column));
  Result<TsbWriter> writer = TsbWriter::create(target.out, definition);
  if (!writer) return Failure{writer.error()};
  const std::size_t steps = table.times.size();
  for (std::size_t i = 0; i < table.items.size(); ++i) {
    const TsbItem& made = definition.items[i];
    const CVdUnitConverter converter(table.items[i].unit, made.unit);
    constexpr std::size_t kAtOnce = 4096;
    std::vector<double> values;
    for (std::size_t step = 0; step < steps; step += values.size()) {
      const auto given = std::span(table.values[i]).subspan(step, std::min(kAtOnce, steps - step));
      values.clear();
      for (const double value : given) {
        values.push_back(std::isnan(value)             ? made.deleteValue
                         : table.items[i].unit.empty() ? value
                                                       : converter.Convert(value));
      }
      if (const Outcome written = writer->write(i + 1, step, std::span<const double>(values)); !written)
        return Failure{written.error()};
      if (!host.reached(i * steps + step + values.size(), table.items.size() * steps))
        return Failure{std::string(kConversionStopped)};
    }
  }
  if (const Outcome written = writer->commit(); !written) return Failure{written.error()};
  const bool even = definition.time.isEquidistant();
  ConvertedSeries converted{
      .items = {}, .steps = steps, .equidistant = even, .first = first, .last = last, .summary = {}};
  for (const TsbItem& made : definition.items) converted.items.push_back(made.name);
  converted.summary = fmt::format(
      "{}: {} of {} time step{}{} from {} to {}\n", target.out, definition.items.front().name, steps,
      steps == 1 ? "" : "s",
      even && steps > 1 ? fmt::format(", {:g} {} apart,", definition.time.step, table.timeUnit) : "", first,
      last);
  return converted;
}

}  // namespace gridbay
