#pragma once

#include <array>
#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "conversion/conversion_host.h"
#include "conversion/table_reader.h"
#include "platform/result.h"

namespace gridbay {

// A line that can't be taken.
struct TableFault {
  std::size_t line = 0;  // from 1
  std::string text;      // of the line
  std::string why;
};

// The values of a table, of which lines at fault are left out.
struct SeriesTable {
  std::array<int, 6> start{};  // year to second, of the axis
  std::string timeUnit = "s";
  std::vector<double> times;  // since the start, rising
  std::vector<TableColumn> items;
  std::vector<std::vector<double>> values;  // of each item, in its column's unit; not-a-number where missing
  std::vector<TableFault> faults;           // the first of them
  std::size_t faultCount = 0;
};

// Why no table can be read by a form: no times, no items, no start; empty for nothing.
std::string faultOf(const TableForm& form);
// What is missing or wrong in what its items are: an item type, a unit that is none of it; empty for nothing.
std::string faultOfItems(const TableForm& form);

// Reads all lines. `reached` is told how much is done (0 to 1) and stops it by false. An error where there
// are no lines of values; where all of them are at fault there are no times.
Result<SeriesTable> readSeriesTable(std::string_view text, const TableForm& form,
                                    const std::function<bool(double)>& reached = {});

// Where a series goes.
struct SeriesTarget {
  std::string out;      // *.tsb0
  std::string title;    // of the file
  std::string history;  // how it came about, a line without the date
};

// The series that was written.
struct ConvertedSeries {
  std::vector<std::string> items;
  std::size_t steps = 0;
  bool equidistant = true;
  std::string first;  // moments of the first and last step, as text
  std::string last;
  std::string summary;  // the same for people, one line
};

// Writes the series, of at least one time and of items without fault, its values in the base units of their
// item types. An error leaves what is at the path as it was.
Result<ConvertedSeries> writeSeriesTable(const SeriesTable& table, const SeriesTarget& target,
                                         ConversionHost& host);

}  // namespace gridbay
