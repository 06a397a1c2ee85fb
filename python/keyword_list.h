#pragma once

#include <string>
#include <utility>
#include <vector>

#include "core/parameter_tree.h"

namespace gridbay::python {

// What is known of a keyword: from the tables that write and take it, and from the control or cell that edits
// it.
struct KeywordNote {
  std::string path;                                       // in the first item of each list
  std::vector<std::pair<ValueKind, std::string>> values;  // those of a new setup
  bool takesAnyNumber = false;
  bool canBeSet = true;
  std::string label;     // of the control, empty where none was found
  std::string page;      // its caption
  std::string quantity;  // with the symbol of its base unit
  std::string unit;
  std::vector<std::pair<std::string, std::string>> choices;  // a value, and what it is called
};

// A list of like sections.
struct ListNote {
  std::string name;      // the path of the sections with {} for the number, from 1
  std::string count;     // the keyword by which it is resized; empty where there is none
  std::string followed;  // the keyword that its length follows, where that is another list's
};

struct KeywordList {
  std::vector<KeywordNote> keywords;
  std::vector<ListNote> lists;
};

// All keywords of the edition, found by trying: a new setup of each module has its lists filled, and each
// control of each page is used, once for each of its choices; what a save would write then has the keywords,
// and what has changed in it is what the control edits. The ecological model is that of a definition file.
// Takes some seconds.
KeywordList collectKeywords(const std::string& definition);

}  // namespace gridbay::python
