#pragma once

#include <string>
#include <vector>

#include "core/message.h"
#include "core/page_id.h"

namespace gridbay {

// A place on a page: a control, or a row of a table or a cell in it, and what stands there.
struct PagePlace {
  PageId page = PageId::none;
  std::string thing = {};    // "area 2"; empty for the page as a whole
  std::string keyword = {};  // its path in the setup; empty where several concern
  // The label of a control or, with a row, the header of a column; empty for any.
  std::string field = {};
  int fieldNumber = 1;     // among those of that label
  std::string value = {};  // what the control or cell holds, as the name of a file; empty for any
  // The row, in the first table that has it: that of an entry, and in it that of an entry of its own. An
  // entry of no known count is the row of its number. Rows of headers do not count.
  std::vector<ListEntry> entries = {};
  int column = 0;  // of the row, or of the first one; 0 for that of the field

  bool isInTable() const { return !entries.empty() || column > 0; }
  bool operator==(const PagePlace&) const = default;
};

}  // namespace gridbay
