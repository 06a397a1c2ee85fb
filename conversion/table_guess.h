#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "conversion/table_reader.h"

namespace gridbay {

// How a table of text is most likely meant, and what it leaves open, each as a sentence for the user.
struct TableGuess {
  TableForm form;  // with no columns where the text is no table
  std::vector<std::string> doubts;
  std::vector<std::string> missingDoubts;  // more of them, for who has not told the missing values
  std::string dateOrderDoubt;  // one more, for who has not told the order of dates; empty for none
};

// Looks at the first lines for separator, headings, names, units and item types; at all of them for the order
// of dates and for missing values, up to some ten thousand.
TableGuess guessTable(std::string_view text);
// The same with what is known before it: the separator (0 to find it) and the number of heading lines (below
// 0 to find it).
TableGuess guessTable(std::string_view text, char separator, int headerLines);

}  // namespace gridbay
