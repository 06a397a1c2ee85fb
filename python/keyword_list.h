#pragma once

#include <string>
#include <utility>
#include <vector>

#include "core/parameter_tree.h"

namespace gridbay::python {

// What is known of a value of a keyword from the control or cell that edits it.
struct ValueNote {
  std::string label;  // empty where none was found
  std::string quantity;
  std::string unit;                                          // the symbol of the quantity's base unit
  std::vector<std::pair<std::string, std::string>> choices;  // a value, and what it is called
};

// What is known of a keyword: from the tables that write and take it, and from the pages.
struct KeywordNote {
  std::string path;                                       // in the first item of each list
  std::vector<std::pair<ValueKind, std::string>> values;  // those of a new setup
  bool takesAnyNumber = false;
  bool canBeSet = true;
  std::string page;              // the caption of that which edits it
  std::vector<ValueNote> parts;  // one for each value; one for all where it takes any number of them
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
// control of each page, and of each dialog that a page opens, is used, once for each of its choices and
// behind each of them; what a save would write then has the keywords, and what has changed in it is what the
// control edits. The ecological model is that of a definition file. Takes some seconds.
KeywordList collectKeywords(const std::string& definition);

}  // namespace gridbay::python
