#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "pages/form.h"
#include "pages/no_host.h"
#include "platform/units/units.h"

namespace gridbay::python {

// A control of a form or a cell of one of its grids, as it can be used at present.
struct Field {
  enum class Kind { typed, check, choice, button };

  std::size_t control = 0;  // its place in the form
  int row = 0;              // of a cell, from 1; 0 for the control itself
  int col = 0;
  std::string rowName = {};  // what the row stands for, as far as the grid tells
  Kind kind = Kind::typed;
  std::string label = {};
  std::string value = {};                 // what it shows
  std::vector<std::string> choices = {};  // of a choice
  bool isCount = false;                   // a number of things, typed
  const QunItem* quantity = nullptr;      // null for a plain number, and for what is none

  // Tells the fields of a form apart, also those of other layouts of a grid.
  std::string key() const;
};

// In the order of the page, of grids the first rows. A control that is disabled or hidden is there, too, as
// its handler takes an edit all the same; but no such button, except that of a file.
std::vector<Field> fieldsOf(Form& form);

// Does what a user would: types the text, makes the choice of that name, sets the check to "0" or "1", or
// presses.
void useField(Form& form, const Field& field, const std::string& text);

// Texts to type in place of another one. Where that holds several numbers, one for each of them with that
// number changed; else those of which the first one that is taken will do.
struct OtherTexts {
  std::vector<std::string> texts;
  bool forEachNumber = false;
};
OtherTexts otherTexts(const std::string& text);

// A host whose user agrees to questions, uses a dialog as he was told, and then leaves it with Cancel.
class DialogHost final : public NoHost {
 public:
  // Whether the dialog is left with OK.
  using Use = std::function<bool(std::string_view title, Form& form)>;

  // The name that is chosen of a data file; of its items each is the one after that which was chosen.
  static constexpr std::string_view kFile = "chosen.tsb2";

  DialogHost() : NoHost(true) {}

  void UseDialog(Use use) { use_ = std::move(use); }
  void ChooseFiles(bool chooses) { choosesFiles_ = chooses; }

  bool editForm(std::string_view title, Form& form, const std::function<std::string()>& fault) override;
  bool choose(CVdFileSelectorDlg& selector) override;

 private:
  Use use_;
  bool choosesFiles_ = false;
};

}  // namespace gridbay::python
