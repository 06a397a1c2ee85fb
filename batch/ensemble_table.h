#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "platform/result.h"

namespace gridbay {

// What the members of an ensemble have in place of what their common setup has: a row for each member and a
// column for each path.
struct EnsembleTable {
  struct Member {
    std::string name;                 // of its file, with no extension
    std::size_t line = 0;             // of the table, from 1
    std::vector<std::string> values;  // one for each path; an empty one leaves what the common setup has
  };

  std::string path;                 // of the table itself, for what is told of it
  std::size_t firstPathColumn = 1;  // from 1; the one before it, if any, has the names
  std::vector<std::string> paths;
  std::vector<Member> members;

  // "table.csv, line 3 (north)", and with a column, from 0: "table.csv, line 3 (north), column 2 (PATH)".
  std::string placeOf(const Member& member) const;
  std::string placeOf(const Member& member, std::size_t column) const;
};

// Reads a table from a CSV file, whose first row has the paths. Where its first cell is empty, "name" or
// "member" in letters of any case, that column has the members' names; else they are the stem with the
// numbers of the members behind it. A name must be able to be that of a file beside others. Errors: no file
// or no rows, a row with another number of cells, no path or the same one twice, a name that is none or there
// twice; each with its line and column.
Result<EnsembleTable> readEnsembleTable(const std::string& path, std::string_view stem);

}  // namespace gridbay
