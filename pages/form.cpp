#include "pages/form.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <optional>

#include "core/number_text.h"
#include "pages/grid_wnd.h"
#include "pages/scan.h"

namespace gridbay {
namespace {

template <class... Handlers>
struct Overloaded : Handlers... {
  using Handlers::operator()...;
};
template <class... Handlers>
Overloaded(Handlers...) -> Overloaded<Handlers...>;

CVdEditStyle styleOf(const Control& control, const UnitChoices& units) {
  return CVdEditStyle(units).SetQunUnitBaseGroup(control.itemCode);
}

// The number that an edit shows, in base units and in the precision of its variable.
template <class Real>
std::optional<Real> realOf(const Control& control, const UnitChoices& units) {
  const std::optional<double> shown = doubleOfText(trimmed(control.text));
  if (!shown) return std::nullopt;
  return static_cast<Real>(styleOf(control, units).UnitConvertFromBase(*shown, 0));
}

template <class Real>
std::string shownText(Real value, const Control& control, const UnitChoices& units) {
  const double shown = styleOf(control, units).UnitConvertFromBase(value, 1);
  return shown == value ? fmt::format("{}", value) : fmt::format("{:.7g}", shown);
}

std::int32_t roundedToInt32(double value) {
  using Limits = std::numeric_limits<std::int32_t>;
  return static_cast<std::int32_t>(
      std::lround(std::clamp(value, double{Limits::min()}, double{Limits::max()})));
}

// What is wrong with the text of an edit as a value for its variable; empty for nothing.
std::string faultOf(const Control& control, const UnitChoices& units) {
  const std::string_view text = trimmed(control.text);
  const auto quoted = [text](const char* what) { return fmt::format("\"{}\" {}", text, what); };
  const auto beyond = [&](auto number) {
    return control.numberFault ? control.numberFault(static_cast<double>(number)) : std::string();
  };
  const auto real = [&]<class Real>(const Real*) {
    const std::optional<double> shown = doubleOfText(text);
    if (!shown || !std::isfinite(*shown)) return quoted("is not a number");
    const Real value = *realOf<Real>(control, units);
    return std::isfinite(value) ? beyond(value) : quoted("is too large");
  };
  return std::visit(Overloaded{[](std::monostate) { return std::string(); },
                               [&](const std::int32_t*) {
                                 const std::optional<double> shown = doubleOfText(text);
                                 if (!shown || !std::isfinite(*shown)) return quoted("is not a number");
                                 if (control.itemCode != 0)
                                   return beyond(roundedToInt32(*realOf<double>(control, units)));
                                 if (text.find_first_of(".eE") != text.npos)
                                   return quoted("is not a whole number");
                                 const std::optional<std::int32_t> number = int32OfText(text);
                                 return number ? beyond(*number) : quoted("is too large");
                               },
                               [&](const float* variable) { return real(variable); },
                               [&](const double* variable) { return real(variable); },
                               [&](const std::string*) {
                                 return control.textFault ? control.textFault(control.text) : std::string();
                               }},
                    control.variable);
}

// Shows the variable in its control.
void showVariable(Control& control, const UnitChoices& units) {
  if (control.absent) {
    control.text.clear();
    control.index = -1;
    return;
  }
  std::visit(Overloaded{[](std::monostate) {},
                        [&](const std::int32_t* value) {
                          control.index = *value;
                          if (!control.isIndexed())
                            control.text = control.itemCode == 0 ? std::to_string(*value)
                                                                 : shownText(*value, control, units);
                        },
                        [&](const float* value) { control.text = shownText(*value, control, units); },
                        [&](const double* value) { control.text = shownText(*value, control, units); },
                        [&](const std::string* value) { control.text = *value; }},
             control.variable);
}

// Takes what a control says into its variable. A text that still shows the value keeps all of its digits.
void takeVariable(const Control& control, const UnitChoices& units) {
  if (control.absent || (!control.isEdit() && !control.isIndexed())) return;
  std::visit(Overloaded{[](std::monostate) {},
                        [&](std::int32_t* value) {
                          if (control.isIndexed()) {
                            *value = control.index;
                          } else if (control.itemCode == 0) {
                            *value = *int32OfText(trimmed(control.text));
                          } else if (control.text != shownText(*value, control, units)) {
                            *value = roundedToInt32(*realOf<double>(control, units));
                          }
                        },
                        [&](float* value) {
                          if (control.text != shownText(*value, control, units))
                            *value = *realOf<float>(control, units);
                        },
                        [&](double* value) {
                          if (control.text != shownText(*value, control, units))
                            *value = *realOf<double>(control, units);
                        },
                        [&](std::string* value) { *value = control.text; }},
             control.variable);
}

// Whether the control, or a frame around it, has such a rule.
bool hasRule(const Control* control, Control::Rule Control::*rule) {
  for (; control != nullptr; control = control->group) {
    if (control->*rule) return true;
  }
  return false;
}

void apply(Control& control, Control::Rule Control::*rule, bool Control::*flag) {
  if (!hasRule(&control, rule)) return;
  const bool own = !(control.*rule) || (control.*rule)();
  control.*flag = own && (control.group == nullptr || control.group->*flag);
}

}  // namespace

std::string Control::name() const {
  std::string name(trimmed(label));
  std::erase(name, '&');
  while (name.ends_with(':') || name.ends_with(' ')) name.pop_back();
  return name;
}

Control& Form::add(ControlKind kind, std::string_view label, Control::Variable variable) {
  controls_.push_back({.kind = kind, .label = std::string(label), .variable = variable, .group = group_});
  return controls_.back();
}

template <class Value>
Value& Form::own() {
  owned_.emplace_back(Value{});
  return std::get<Value>(owned_.back());
}

Control& Form::Group(std::string_view caption, const std::function<void()>& body) {
  Control& frame = add(ControlKind::group, caption);
  Control* outer = std::exchange(group_, &frame);
  body();
  group_ = outer;
  return frame;
}

Control& Form::Shown(std::string_view label, std::function<std::string()> text) {
  Control& control = add(ControlKind::label, label);
  control.load = [&control, text = std::move(text)] { control.text = text(); };
  return control;
}

Control& Form::Button(std::string_view label, std::function<void()> pressed) {
  return add(ControlKind::button, label).Changed(std::move(pressed));
}

Control& Form::Grid(std::string_view label, CV27SetupGridWnd& grid) {
  Control& control = add(ControlKind::grid, label);
  control.grid = &grid;
  return control.AlignRight().AlignBottom();
}

template <class Value>
Control& Form::addBound(std::string_view label, Binding<Value> binding, int itemCode) {
  Value& variable = own<Value>();
  Control& control = add(ControlKind::text, label, &variable);
  control.itemCode = itemCode;
  control.load = [&control, &variable, get = std::move(binding.get)] {
    const std::optional<Value> value = get();
    control.absent = !value;
    if (value) variable = *value;
  };
  if (binding.set) {
    control.save = [&control, &variable, set = std::move(binding.set)] {
      if (!control.absent) set(variable);
    };
  } else {
    control.readOnly = true;
  }
  if (!binding.fault) return control;
  if constexpr (std::is_arithmetic_v<Value>) {
    control.numberFault = [fault = std::move(binding.fault)](double value) {
      return fault(static_cast<Value>(value));
    };
  } else {
    control.textFault = std::move(binding.fault);
  }
  return control;
}

Control& Form::Number(std::string_view label, Binding<std::int32_t> number, int itemCode) {
  return addBound(label, std::move(number), itemCode);
}
Control& Form::Number(std::string_view label, Binding<float> number, int itemCode) {
  return addBound(label, std::move(number), itemCode);
}
Control& Form::Number(std::string_view label, Binding<double> number, int itemCode) {
  return addBound(label, std::move(number), itemCode);
}
Control& Form::Text(std::string_view label, Binding<std::string> text) {
  return addBound(label, std::move(text), 0);
}

// A date that is none is shown as such, and kept until there is another one.
Control& Form::DateTimeEdit(std::string_view label, Binding<DateTime> moment) {
  const auto shown = [get = moment.get]() -> std::optional<std::string> {
    const std::optional<DateTime> held = get();
    return held ? std::optional(dateTimeText(*held)) : std::nullopt;
  };
  Control& control = addBound<std::string>(
      label,
      {.get = shown,
       .set =
           [shown, set = std::move(moment.set)](const std::string& text) {
             if (const std::optional<DateTime> typed = dateTimeOfText(trimmed(text));
                 typed && text != shown())
               set(*typed);
           },
       .fault =
           [shown](const std::string& text) {
             const bool isDate = text == shown() || dateTimeOfText(trimmed(text));
             return isDate ? std::string()
                           : fmt::format("\"{}\" is not of the form YYYY-MM-DD hh:mm:ss", trimmed(text));
           }},
      0);
  control.kind = ControlKind::dateTime;
  return control;
}

// A value that is neither of the two is left alone while the box shows it as it stands.
Control& Form::Check(std::string_view label, Binding<std::int32_t> flag, std::int32_t on, std::int32_t off) {
  const auto isOn = [on](std::int32_t value) { return (value != 0) == (on != 0) ? 1 : 0; };
  Control& control = addBound<std::int32_t>(label,
                                            {.get = [get = flag.get, isOn]() -> std::optional<std::int32_t> {
                                               const std::optional<std::int32_t> held = get();
                                               return held ? std::optional(isOn(*held)) : std::nullopt;
                                             },
                                             .set =
                                                 [flag = std::move(flag), isOn, on, off](std::int32_t index) {
                                                   const std::int32_t held = flag.get().value_or(off);
                                                   if (held == on || held == off || index != isOn(held))
                                                     flag.set(index == 1 ? on : off);
                                                 }},
                                            0);
  control.kind = ControlKind::check;
  return control;
}

Control& Form::addIndexed(ControlKind kind, std::string_view label, Choices choices,
                          Binding<std::int32_t> value) {
  std::vector<std::string> texts = choices.texts();
  Control& control =
      addBound<std::int32_t>(label,
                             {.get = [choices, get = std::move(value.get)]() -> std::optional<std::int32_t> {
                                const std::optional<std::int32_t> held = get();
                                return held ? std::optional(choices.placeOf(*held)) : std::nullopt;
                              },
                              .set =
                                  [choices, set = std::move(value.set)](std::int32_t place) {
                                    const std::optional<std::int32_t> chosen = choices.valueAt(place);
                                    if (chosen && set) set(*chosen);
                                  }},
                             0);
  control.kind = kind;
  if (kind == ControlKind::radio) control.choiceEnabled.assign(texts.size(), true);
  control.choices = std::move(texts);
  return control;
}

Control& Form::Radio(std::string_view label, Choices choices, Binding<std::int32_t> value) {
  return addIndexed(ControlKind::radio, label, std::move(choices), std::move(value));
}
Control& Form::List(std::string_view label, Choices choices, Binding<std::int32_t> value) {
  return addIndexed(ControlKind::dropDown, label, std::move(choices), std::move(value));
}

Control& Form::List(std::string_view label, std::function<Choices()> choices, Binding<std::int32_t> value) {
  std::int32_t& place = own<std::int32_t>();
  Control& control = add(ControlKind::dropDown, label, &place);
  control.load = [&control, &place, choices, get = std::move(value.get)] {
    const std::optional<std::int32_t> held = get();
    const Choices offered = held ? choices() : Choices();
    control.absent = !held;
    control.choices = offered.texts();
    place = offered.placeOf(held.value_or(0));
  };
  control.save = [&control, &place, choices, set = std::move(value.set)] {
    const std::optional<std::int32_t> chosen = control.absent ? std::nullopt : choices().valueAt(place);
    if (chosen) set(*chosen);
  };
  return control;
}

Control& Form::TextList(std::string_view label, std::function<std::vector<std::string>()> choices,
                        Binding<std::string> value) {
  std::int32_t& place = own<std::int32_t>();
  Control& control = add(ControlKind::dropDown, label, &place);
  control.load = [&control, &place, choices = std::move(choices), get = std::move(value.get)] {
    const std::optional<std::string> held = get();
    control.absent = !held;
    control.choices = held ? choices() : std::vector<std::string>();
    const auto found = std::ranges::find(control.choices, held.value_or(""));
    place = found == control.choices.end() ? -1 : static_cast<std::int32_t>(found - control.choices.begin());
  };
  control.save = [&control, &place, set = std::move(value.set)] {
    if (place >= 0 && place < static_cast<std::int32_t>(control.choices.size()))
      set(control.choices[static_cast<std::size_t>(place)]);
  };
  return control;
}

Control& Form::Count(std::string_view label, Binding<std::int32_t> count, int highest, int highestSpin,
                     int lowest) {
  const auto get = count.get;
  count.set = [get, set = std::move(count.set), lowest, highest](std::int32_t wanted) {
    const std::int32_t now = get().value_or(0);
    if (wanted != now && wanted >= lowest && wanted <= std::max(highest, now)) set(wanted);
  };
  Control& control = addBound(label, std::move(count), 0);
  control.Spin(lowest, highestSpin, [this, &control, get](int delta) {
    const std::int32_t now = get().value_or(0);
    const std::int64_t wanted = std::int64_t{now} + delta;
    if (!control.usable() || delta == 0 || wanted < control.spinLowest) return;
    if (delta > 0 && wanted > control.spinHighest) return;
    control.text = std::to_string(wanted);
    changed(control);
  });
  return control;
}

Control& Form::DDX_Text(std::string_view label, std::int32_t& variable) {
  return add(ControlKind::text, label, &variable);
}
Control& Form::DDX_Text(std::string_view label, std::string& variable) {
  return add(ControlKind::text, label, &variable);
}
Control& Form::DDX_Check(std::string_view label, std::int32_t& variable) {
  return add(ControlKind::check, label, &variable);
}

Control& Form::DDX_Radio(std::string_view label, std::vector<std::string> choices, std::int32_t& variable) {
  Control& control = add(ControlKind::radio, label, &variable);
  control.choiceEnabled.assign(choices.size(), true);
  control.choices = std::move(choices);
  return control;
}

Control& Form::DDX_CBIndex(std::string_view label, std::vector<std::string> choices, std::int32_t& variable) {
  Control& control = add(ControlKind::dropDown, label, &variable);
  control.choices = std::move(choices);
  return control;
}

Control& Form::DDX_VDedit(std::string_view label, float& variable, int itemCode) {
  Control& control = add(ControlKind::text, label, &variable);
  control.itemCode = itemCode;
  return control;
}

Control& Form::DDX_VDedit(std::string_view label, double& variable, int itemCode) {
  Control& control = add(ControlKind::text, label, &variable);
  control.itemCode = itemCode;
  return control;
}

Control* Form::find(std::string_view label) {
  const auto found = std::ranges::find(controls_, label, &Control::label);
  return found == controls_.end() ? nullptr : &*found;
}

Control& Form::DDX_VdText(std::string_view label, std::int32_t& variable, int itemCode) {
  Control& control = DDX_Text(label, variable);
  control.itemCode = itemCode;
  return control;
}

void Form::changed(Control& control) {
  if (control.onChange) {
    control.onChange();
  } else if (onAnyChange_ && !std::holds_alternative<std::monostate>(control.variable)) {
    onAnyChange_();
  }
}

void Form::guarded(const std::function<void()>& action) {
  if (guard_) {
    guard_(action);
  } else {
    action();
  }
}

void Form::act(Control& control) {
  acting_ = &control;
  guarded([&] { changed(control); });
  acting_ = nullptr;
}

void Form::spin(Control& control, int delta) {
  acting_ = &control;
  spinning_ = true;
  if (control.onSpin) guarded([&] { control.onSpin(delta); });
  spinning_ = false;
  acting_ = nullptr;
}

void Form::load() {
  for (Control& control : controls_) {
    if (control.load) control.load();
    if (control.caption) control.label = control.caption();
    if (control.tip) control.toolTip = control.tip();
    if (control.grid != nullptr) control.grid->OnRefresh();
  }
}

void Form::show(const UnitChoices& units, bool keepFaults) {
  for (Control& control : controls_) {
    if (const QunUnit* unit = units.unitOf(control.itemCode); unit != nullptr) control.unit = unit->symbol;
    if (keepFaults && !control.fault.empty() && !control.absent) continue;
    control.fault.clear();
    showVariable(control, units);
  }
}

void Form::applyRules() {
  for (Control& control : controls_) {
    if (std::exchange(control.wasAbsent, control.absent) && !control.absent) control.enabled = true;
    apply(control, &Control::enabledIf, &Control::enabled);
    if (control.absent) control.enabled = false;
    apply(control, &Control::visibleIf, &Control::visible);
    if (control.readOnlyIf) control.readOnly = control.readOnlyIf();
    for (std::size_t i = 0; control.choiceIf && i < control.choiceEnabled.size(); ++i)
      control.choiceEnabled[i] = control.choiceIf(static_cast<int>(i));
    if (control.grid != nullptr) control.grid->SetEnabled(control.enabled);
  }
}

std::string Form::store(const UnitChoices& units) {
  std::string first;
  for (Control& control : controls_) {
    if (!control.isEdit()) continue;
    control.fault = control.absent ? std::string() : faultOf(control, units);
    if (control.fault.empty()) continue;
    // Nobody could mend what is out of use.
    if (control.usable()) {
      if (first.empty()) first = control.faultText();
    } else {
      control.fault.clear();
      showVariable(control, units);
    }
  }
  if (!first.empty()) return first;
  for (const Control& control : controls_) takeVariable(control, units);
  return {};
}

void Form::save() {
  for (const Control& control : controls_) {
    if (control.save) control.save();
  }
}

bool Form::storeActing(const UnitChoices& units) {
  if (acting_ == nullptr || !acting_->save || !acting_->fault.empty()) return false;
  takeVariable(*acting_, units);
  acting_->save();
  return true;
}

}  // namespace gridbay
