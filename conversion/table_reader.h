#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "conversion/table_dates.h"

namespace gridbay {

// What a column of a table of text holds.
struct TableColumn {
  enum class Role {
    item,  // values of an item of the series
    leftOut,
    date,       // a date, with or without a time of day
    clock,      // a time of day, to be added to the date
    dayNumber,  // days since 1899-12-30, as spreadsheets count
    time,       // a number since the start, in the form's unit of time
  };
  Role role = Role::item;
  std::string name;
  std::string unit;  // of the values, as data files have it; empty for the base unit of the item type
  int itemType = 0;  // by its code; 0 for none that is known

  bool operator==(const TableColumn&) const = default;
};

// How a table of text is to be read. It has one column of times, or one of dates with or without a clock.
struct TableForm {
  char separator = ',';  // a blank stands for any number of them
  bool decimalComma = false;
  int headerLines = 0;
  DateOrder dateOrder = DateOrder::yearMonthDay;
  std::string start;           // the moment of time 0, "YYYY-MM-DD hh:mm:ss", for times that are numbers
  std::string timeUnit = "s";  // of them
  bool takesMissing = true;    // fields with no value, or one of these, are missing values; else faults
  std::vector<double> missing;
  std::vector<TableColumn> columns;

  bool hasRole(TableColumn::Role role) const;
};

// A line of the table by its form.
struct TableRow {
  double time = 0;             // in the unit of time, or seconds since 1899-12-30 where there are dates
  std::vector<double> values;  // of the items, in the order of their columns; not-a-number where missing
  std::string fault;           // why the line can't be taken; empty for nothing
  int faultyColumn = -1;       // from 0; -1 where the line as a whole is at fault
};

// The fields of a line, without the blanks and quotes around them. Between blanks, words of a heading are
// kept together by `leastBlanks` of 2.
std::vector<std::string_view> tableFields(std::string_view line, char separator, std::size_t leastBlanks = 1);
// Whether nothing stands there.
bool isBlankLine(std::string_view line);

// A number as the table writes it; nothing for any other text.
std::optional<double> tableNumber(std::string_view text, bool decimalComma);
// Whether a text stands for no value: nothing, dashes, "NaN", "NA", "null" and the like.
bool isMissingText(std::string_view text);

TableRow readTableRow(std::string_view line, const TableForm& form);

}  // namespace gridbay
