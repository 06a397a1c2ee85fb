#pragma once

#include <cstdint>
#include <deque>
#include <functional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "core/date_time.h"
#include "pages/binding.h"
#include "pages/choices.h"
#include "platform/units/edit_style.h"

namespace gridbay {

class CV27SetupGridWnd;

enum class ControlKind { group, text, check, radio, dropDown, label, button, grid, dateTime };

// One control of a page, as any renderer needs it: what it is, what it shows, whether it can be used, and
// what happens when the user changes it.
struct Control {
  using Variable = std::variant<std::monostate, std::int32_t*, float*, double*, std::string*>;
  using Rule = std::function<bool()>;

  ControlKind kind;
  std::string label;
  Variable variable = {};
  std::vector<std::string> choices = {};  // of a radio group or drop-down list
  int itemCode = 0;                       // the quantity of a number; 0 for a plain one
  CV27SetupGridWnd* grid = nullptr;

  // Where it stands: in a frame, or null for the page itself; and beside the control or frame before it
  // instead of below it. What is aligned stretches with the page to that side.
  Control* group = nullptr;
  bool beside = false;
  bool isFile = false;  // an edit that holds the name of a file
  bool alignRight = false;
  bool alignBottom = false;

  std::string text = {};  // what an edit or a label shows
  std::string unit = {};  // the symbol of the unit that it is shown in; empty for a plain one
  int index = -1;         // the choice; 0 or 1 of a check box
  bool enabled = true;
  bool visible = true;
  bool readOnly = false;
  bool absent = false;  // there is nothing that it would edit: it shows nothing, and is disabled
  bool wasAbsent = false;
  std::string fault = {};  // what is wrong with the text, which is kept as it was typed; empty for nothing
  std::string toolTip = {};
  std::vector<bool> choiceEnabled = {};  // of a radio group; empty when all are

  std::function<void()> onChange = {};         // an edit, click or selection; the press of a button
  std::function<void(int delta)> onSpin = {};  // a step of the spin button beside an edit, where it has one
  int spinLowest = 0;
  int spinHighest = 0;

  // Between the model and the variable, and the rules by which the frame sets what stands above: what has no
  // rule follows its frame, and is left alone outside of one that has a rule.
  std::function<void()> load = {};
  std::function<void()> save = {};
  std::function<std::string(double)> numberFault = {};  // beyond being a number
  std::function<std::string(const std::string&)> textFault = {};
  std::function<std::string()> caption = {};  // the label
  std::function<std::string()> tip = {};      // the tool tip
  Rule enabledIf = {};
  Rule visibleIf = {};
  Rule readOnlyIf = {};
  std::function<bool(int place)> choiceIf = {};  // which choices of a radio group can be chosen

  // In place of the default, which brings the form into the model.
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
  Control& Disabled() {
    enabled = false;
    return *this;
  }
  Control& AlignRight() {
    alignRight = true;
    return *this;
  }
  Control& AlignBottom() {
    alignBottom = true;
    return *this;
  }
  Control& Caption(std::function<std::string()> worded) {
    caption = std::move(worded);
    return *this;
  }
  Control& Tip(std::function<std::string()> worded) {
    tip = std::move(worded);
    return *this;
  }
  Control& EnabledIf(Rule rule) {
    enabledIf = std::move(rule);
    return *this;
  }
  Control& VisibleIf(Rule rule) {
    visibleIf = std::move(rule);
    return *this;
  }
  Control& ReadOnlyIf(Rule rule) {
    readOnlyIf = std::move(rule);
    return *this;
  }
  Control& ChoicesIf(std::function<bool(int place)> rule) {
    choiceIf = std::move(rule);
    return *this;
  }
  // The label with no accelerator and no colon, as a name in a sentence.
  std::string name() const;
  // The fault with the name of the field.
  std::string faultText() const { return name() + ": " + fault; }
  bool isIndexed() const {
    return kind == ControlKind::check || kind == ControlKind::radio || kind == ControlKind::dropDown;
  }
  bool isEdit() const { return kind == ControlKind::text || kind == ControlKind::dateTime; }
  bool usable() const { return enabled && visible && !readOnly && !absent; }
};

// The controls of a page in their order, each bound to the member that it edits. The page lists them once;
// the frame loads and stores them by the list, a renderer builds widgets from it, a test finds a control in
// it.
//
// A member is named by a function that gives its object, and the member: Number("Depth:", area,
// &Area::depth).
class Form {
 public:
  Form() = default;
  virtual ~Form() = default;
  Form(const Form&) = delete;
  Form& operator=(const Form&) = delete;

  // A frame around all that the body adds.
  Control& Group(std::string_view caption, const std::function<void()>& body);
  // A text that is worked out anew each time.
  Control& Shown(std::string_view label, std::function<std::string()> text);
  // What a press changes it changes in the model, and then tells the page.
  Control& Button(std::string_view label, std::function<void()> pressed);
  Control& Grid(std::string_view label, CV27SetupGridWnd& grid);

  // A number; with an item code it has that quantity, and is shown in the user's unit.
  Control& Number(std::string_view label, Binding<std::int32_t> number, int itemCode = 0);
  Control& Number(std::string_view label, Binding<float> number, int itemCode = 0);
  Control& Number(std::string_view label, Binding<double> number, int itemCode = 0);
  Control& Text(std::string_view label, Binding<std::string> text);
  Control& DateTimeEdit(std::string_view label, Binding<DateTime> moment);
  // A check box that stores `on` or `off`.
  Control& Check(std::string_view label, Binding<std::int32_t> flag, std::int32_t on = 1,
                 std::int32_t off = 0);
  Control& Radio(std::string_view label, Choices choices, Binding<std::int32_t> value);
  Control& List(std::string_view label, Choices choices, Binding<std::int32_t> value);
  // A list whose choices follow the model.
  Control& List(std::string_view label, std::function<Choices()> choices, Binding<std::int32_t> value);
  // A list of texts that follows the model; what is stored is the text.
  Control& TextList(std::string_view label, std::function<std::vector<std::string>()> choices,
                    Binding<std::string> value);
  // A count with a spin button. What is out of lowest to highest is not taken, but for a count that is beyond
  // already: it may come back. The spin button may end before the edit.
  Control& Count(std::string_view label, Binding<std::int32_t> count, int highest, int highestSpin,
                 int lowest = 0);
  Control& Count(std::string_view label, Binding<std::int32_t> count, int highest) {
    return Count(label, std::move(count), highest, highest);
  }

  // The same for a member of an object.
  template <class Access, class Owner, class Member>
  Control& Number(std::string_view label, Access object, Member Owner::*member, int itemCode = 0) {
    return Number(label, memberOf(object, member), itemCode);
  }
  template <class Access, class Owner>
  Control& Text(std::string_view label, Access object, std::string Owner::*member) {
    return Text(label, memberOf(object, member));
  }
  template <class Access, class Owner>
  Control& DateTimeEdit(std::string_view label, Access object, DateTime Owner::*member) {
    return DateTimeEdit(label, memberOf(object, member));
  }
  template <class Access, class Owner, class Member>
  Control& Check(std::string_view label, Access object, Member Owner::*member, std::int32_t on = 1,
                 std::int32_t off = 0) {
    return Check(label, memberOf(object, member), on, off);
  }
  template <class Access, class Owner, class Member>
  Control& Radio(std::string_view label, Choices choices, Access object, Member Owner::*member) {
    return Radio(label, std::move(choices), memberOf(object, member));
  }
  template <class Access, class Owner, class Member>
  Control& List(std::string_view label, Choices choices, Access object, Member Owner::*member) {
    return List(label, std::move(choices), memberOf(object, member));
  }

  // Controls tied to variables, for what is no part of a model.
  Control& DDX_Text(std::string_view label, std::int32_t& variable);
  Control& DDX_Text(std::string_view label, std::string& variable);
  Control& DDX_Check(std::string_view label, std::int32_t& variable);
  Control& DDX_Radio(std::string_view label, std::vector<std::string> choices, std::int32_t& variable);
  Control& DDX_CBIndex(std::string_view label, std::vector<std::string> choices, std::int32_t& variable);
  Control& DDX_Control(std::string_view label, CV27SetupGridWnd& grid) { return Grid(label, grid); }
  // A number with a unit: the variable holds it in the base unit, the control shows it in the user's.
  Control& DDX_VDedit(std::string_view label, float& variable, int itemCode);
  Control& DDX_VDedit(std::string_view label, double& variable, int itemCode);
  // The same for any kind of number; an integer is rounded in the base unit.
  Control& DDX_VdText(std::string_view label, std::int32_t& variable, int itemCode);
  Control& DDX_VdText(std::string_view label, float& variable, int itemCode) {
    return DDX_VDedit(label, variable, itemCode);
  }
  Control& DDX_VdText(std::string_view label, double& variable, int itemCode) {
    return DDX_VDedit(label, variable, itemCode);
  }

  std::deque<Control>& controls() { return controls_; }
  // The first control of a label, or null.
  Control* find(std::string_view label);

  // What a change does where the control has no handler of its own.
  void SetDefaultHandler(std::function<void()> handler) { onAnyChange_ = std::move(handler); }
  // The user has changed a control, or stepped its count: its handler runs, and `acting` is the control for
  // as long, so that what it does has a name.
  // These two are what a renderer calls, which links nothing of this.
  virtual void act(Control& control);
  virtual void spin(Control& control, int delta);
  // Around what an act does; without one it is simply done.
  void SetGuard(std::function<void(const std::function<void()>&)> guard) { guard_ = std::move(guard); }
  const Control* acting() const { return acting_; }
  bool isSpinning() const { return spinning_; }

  // From the model to the variables, from there to the controls, and by the rules to what can be used. A text
  // with a fault is kept as it was typed if that is wanted; it has none afterwards otherwise.
  void load();
  void show(const UnitChoices& units, bool keepFaults = false);
  void applyRules();

  // Controls to variables. Empty when all went well; else what is wrong with the first text that is no value,
  // and no variable has changed.
  std::string store(const UnitChoices& units);
  // Variables to the model.
  void save();
  // The acting control alone, all the way to the model; false when it says nothing that can be stored.
  bool storeActing(const UnitChoices& units);

 private:
  void guarded(const std::function<void()>& action);
  Control& add(ControlKind kind, std::string_view label, Control::Variable variable = {});
  template <class Value>
  Control& addBound(std::string_view label, Binding<Value> binding, int itemCode);
  Control& addIndexed(ControlKind kind, std::string_view label, Choices choices, Binding<std::int32_t> value);
  template <class Value>
  Value& own();
  void changed(Control& control);

  std::deque<Control> controls_;
  std::deque<std::variant<std::int32_t, float, double, std::string>> owned_;  // variables of bound controls
  std::function<void()> onAnyChange_;
  Control* group_ = nullptr;  // that is being filled
  std::function<void(const std::function<void()>&)> guard_;
  Control* acting_ = nullptr;
  bool spinning_ = false;
};

}  // namespace gridbay
