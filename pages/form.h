#pragma once

#include <cstdint>
#include <deque>
#include <functional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "platform/units/edit_style.h"

namespace gridbay {

class CV27SetupGridWnd;

enum class ControlKind { group, text, check, radio, dropDown, label, button, grid, dateTime };

// One control of a page, as any renderer needs it: what it is, what it shows, whether it can be used, and
// what happens when the user changes it.
struct Control {
  using Variable = std::variant<std::monostate, std::int32_t*, float*, double*, std::string*>;

  ControlKind kind;
  std::string label;
  Variable variable = {};
  std::vector<std::string> choices = {};  // of a radio group or drop-down list
  int itemCode = 0;                       // the quantity of a number; 0 for a plain one
  CV27SetupGridWnd* grid = nullptr;

  // Where it stands: in a frame, or null for the page itself; and beside the control or frame before it
  // instead of below it.
  Control* group = nullptr;
  bool beside = false;
  bool isFile = false;  // an edit that holds the name of a file

  std::string text = {};  // what an edit or a label shows
  std::string unit = {};  // the symbol of the unit that it is shown in; empty for a plain one
  int index = -1;         // the choice; 0 or 1 of a check box
  bool enabled = true;
  bool visible = true;
  bool readOnly = false;
  std::string fault = {};  // what is wrong with the text, which is kept as it was typed; empty for nothing
  std::string toolTip = {};
  std::vector<bool> choiceEnabled = {};  // of a radio group; empty when all are

  std::function<void()> onChange = {};         // an edit, click or selection; the press of a button
  std::function<void(int delta)> onSpin = {};  // a step of the spin button beside an edit, where it has one
  int spinLowest = 0;
  int spinHighest = 0;

  Control& Changed(std::function<void()> handler) {
    onChange = std::move(handler);
    return *this;
  }
  Control& Spin(int lowest, int highest, std::function<void(int)> handler) {
    spinLowest = lowest;
    spinHighest = highest;
    onSpin = std::move(handler);
    return *this;
  }
  Control& Beside() {
    beside = true;
    return *this;
  }
  Control& Hidden() {
    visible = false;
    return *this;
  }
  Control& ReadOnly() {
    readOnly = true;
    return *this;
  }
  // The label with no accelerator and no colon, as a name in a sentence.
  std::string name() const;
  bool usable() const { return enabled && visible && !readOnly; }
};

// The controls of a page in their order, each tied to a variable of the page. The page lists them once; the
// frame loads and stores them by the list, a renderer builds widgets from it, a test finds a control in it.
class Form {
 public:
  Control& Group(std::string_view caption);
  // A frame around all that the body adds.
  Control& Group(std::string_view caption, const std::function<void()>& body);
  Control& Label(std::string_view label, std::string& variable);
  Control& Button(std::string_view label, std::function<void()> pressed);
  Control& DDX_Text(std::string_view label, std::int32_t& variable);
  Control& DDX_Text(std::string_view label, std::string& variable);
  Control& DDX_Check(std::string_view label, std::int32_t& variable);
  Control& DDX_Radio(std::string_view label, std::vector<std::string> choices, std::int32_t& variable);
  Control& DDX_CBIndex(std::string_view label, std::vector<std::string> choices, std::int32_t& variable);
  Control& DDX_Control(std::string_view label, CV27SetupGridWnd& grid);
  // A number with a unit: the variable holds it in the base unit, the control shows it in the user's.
  Control& DDX_VDedit(std::string_view label, float& variable, int itemCode);
  Control& DDX_VDedit(std::string_view label, double& variable, int itemCode);

  std::deque<Control>& controls() { return controls_; }
  // The first control of a label, or null; the control that is tied to a variable.
  Control* find(std::string_view label);
  Control& of(const void* variable);

  // The user has changed a control, or stepped its count: its handler runs, and `acting` is the control for
  // as long, so that what it does has a name.
  void act(Control& control) {
    acting_ = &control;
    if (control.onChange) control.onChange();
    acting_ = nullptr;
  }
  void spin(Control& control, int delta) {
    acting_ = &control;
    spinning_ = true;
    if (control.onSpin) control.onSpin(delta);
    spinning_ = false;
    acting_ = nullptr;
  }
  const Control* acting() const { return acting_; }
  bool isSpinning() const { return spinning_; }

  // The same for any kind of number; an integer is rounded in the base unit.
  Control& DDX_VdText(std::string_view label, std::int32_t& variable, int itemCode);
  Control& DDX_VdText(std::string_view label, float& variable, int itemCode) {
    return DDX_VDedit(label, variable, itemCode);
  }
  Control& DDX_VdText(std::string_view label, double& variable, int itemCode) {
    return DDX_VDedit(label, variable, itemCode);
  }

  // Variables to controls.
  void show(const UnitChoices& units);
  // Controls to variables. Empty when all went well; else what is wrong with a text, and no variable has
  // changed.
  std::string store(const UnitChoices& units);

 private:
  Control& add(ControlKind kind, std::string_view label, Control::Variable variable = {});

  std::deque<Control> controls_;
  Control* group_ = nullptr;  // that is being filled
  const Control* acting_ = nullptr;
  bool spinning_ = false;
};

}  // namespace gridbay
