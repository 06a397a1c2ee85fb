#pragma once

#include <map>
#include <optional>
#include <string>
#include <vector>

#include "conversion/conversion_host.h"
#include "conversion/series_table.h"
#include "platform/result.h"

namespace gridbay {

// Which table of text is to become which time series, and how. Without a start the table itself tells what it
// holds; its names, units and dates are recognised, and a value may be missing.
struct SeriesConversion {
  std::string in;   // lines of a time and values, between commas, semicolons, tabs or blanks
  std::string out;  // the time series (*.tsb0)
  std::vector<std::string> itemTypes;  // one for all columns or one for each: code, name or beginning of one
  std::string start;                   // the moment of time 0, "YYYY-MM-DD hh:mm:ss"
  std::string timeUnit = "s";          // s, min, h, d
  int skipLines = 0;                   // heading lines; the last one names the columns
  bool force = false;                  // replaces a file that is there
  std::string history;                 // how the series came about, a line of its history without the date
  std::optional<DateOrder> dateOrder = {};  // of dates that do not tell it themselves
  // Numbers that stand for missing values; where there are some a value may be missing with a start too.
  std::vector<double> missing = {};
};

// What a user calls them: "ymd", "dmy", "mdy".
const std::map<std::string, DateOrder>& dateOrderNames();

// Makes a time series from delimited text. An error leaves what is at the path as it was.
Result<ConvertedSeries> convertSeries(const SeriesConversion& conversion, ConversionHost& host);

}  // namespace gridbay
