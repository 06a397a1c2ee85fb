#pragma once

#include <string>
#include <vector>

#include "platform/result.h"

namespace gridbay {

// A row of a table of texts, with the line of the file that it begins in, from 1.
struct CsvRow {
  std::size_t line = 0;
  std::vector<std::string> cells;
};

// The rows of a text file that are not empty, by the rules of RFC 4180: cells parted by commas, or by the
// semicolons or tabs that the first line has instead, and quoted where they hold such a sign, a quote or a
// line feed. Blanks around a cell that is not quoted are dropped.
Result<std::vector<CsvRow>> readCsv(const std::string& path);

// A row with its line feed, every cell quoted.
std::string csvLine(const std::vector<std::string>& cells);

}  // namespace gridbay
