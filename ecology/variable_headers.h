#pragma once

#include <algorithm>
#include <string>

#include "ecology/transport_page_texts.h"
#include "ecology/transported.h"
#include "platform/units/edit_style.h"

namespace gridbay {

// What the tool tip of a value says: its range, in the units that the user has chosen; empty without a
// declaration.
std::string rangeTip(const CSolverItem* declared, const UnitChoices& units);

// The unit of a value, as the user has chosen it for the quantity, or as the definition words it; and what
// its tool tip says, with the quantity. Both are empty without a declaration.
std::string unitText(const CSolverItem* declared, const UnitChoices& units);
std::string unitTip(const CSolverItem* declared, const UnitChoices& units);

// The transported variables as pages show them: each value with its range.
struct ShownWqsVariables : WqsVariables {
  static std::string tip(CKvsBase& object, const UnitChoices& units, int variable) {
    return rangeTip(declaration(object, variable), units);
  }
};

// The same with their numbers in the headers, on two lines.
struct NumberedWqsVariables : ShownWqsVariables {
  static std::string name(CKvsBase& object, int variable) {
    return formatted(texts::variableHeader, variable, WqsVariables::name(object, variable));
  }
};

// A grid with such headers, over the grid of a family: the name of an edit is on one line.
template <class Grid>
class NumberedVariableGrid : public Grid {
 protected:
  std::string editName(int row, int col) override {
    std::string name = Grid::editName(row, col);
    std::erase(name, '\r');
    std::ranges::replace(name, '\n', ' ');
    return name;
  }
};

}  // namespace gridbay
