#pragma once

#include <string>
#include <vector>

#include "pages/form.h"

namespace gridbay {

// What a control shows, or why it shows nothing.
struct ShownField {
  std::string label;  // as the form has it, with what number among the controls of that label, from 1
  int number = 1;
  std::string name;
  std::string value;  // for people: "0.02 m", "on", the chosen text
  bool isShown = true;
  bool isValue = true;  // a user could give it another one
};

struct ShownCell {
  std::string name;  // "Type, row 2"
  std::string value;
  bool isValue = false;
};

// The rows and columns of a table, without headers. Both count from 1 for the table itself.
struct ShownTable {
  std::string name = {};  // of the table, where a page has several
  std::vector<std::string> columns = {};
  struct Row {
    int number = 0;         // in the table
    std::string name = {};  // "Row 2"
    bool isEntry = true;    // no title or further header
    std::vector<ShownCell> cells = {};
  };
  std::vector<Row> rows = {};
};

// What a page shows, in the order of its controls. Where the current row of a table decides what the rest
// shows, that is a detail of each row.
struct PageContents {
  std::vector<ShownField> fields = {};
  std::vector<ShownTable> tables = {};
  std::vector<PageContents> details = {};

  // How much it is to read.
  std::size_t size() const;
};

PageContents contentsOf(Form& form);

}  // namespace gridbay
