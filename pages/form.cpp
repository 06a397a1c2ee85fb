#include "pages/form.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <optional>

#include "core/number_text.h"

namespace gridbay {
namespace {

template <class... Handlers>
struct Overloaded : Handlers... {
  using Handlers::operator()...;
};
template <class... Handlers>
Overloaded(Handlers...) -> Overloaded<Handlers...>;

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(" \t");
  if (first == text.npos) return {};
  return text.substr(first, text.find_last_not_of(" \t") - first + 1);
}

bool isIndexed(const Control& control) {
  return control.kind == ControlKind::check || control.kind == ControlKind::radio ||
         control.kind == ControlKind::dropDown;
}

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

// Whether the text of an edit is a value for its variable.
bool isValid(const Control& control) {
  return std::visit(Overloaded{[](std::monostate) { return true; },
                               [&](const std::int32_t*) {
                                 if (control.itemCode != 0)
                                   return doubleOfText(trimmed(control.text)).has_value();
                                 const std::string_view text = trimmed(control.text);
                                 return int32OfText(text).has_value() &&
                                        text.find_first_of(".eE") == text.npos;
                               },
                               [&](const float*) { return doubleOfText(trimmed(control.text)).has_value(); },
                               [&](const double*) { return doubleOfText(trimmed(control.text)).has_value(); },
                               [](const std::string*) { return true; }},
                    control.variable);
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

Control& Form::Group(std::string_view caption) {
  return add(ControlKind::group, caption);
}

Control& Form::Group(std::string_view caption, const std::function<void()>& body) {
  Control& frame = add(ControlKind::group, caption);
  Control* outer = std::exchange(group_, &frame);
  body();
  group_ = outer;
  return frame;
}

Control& Form::Label(std::string_view label, std::string& variable) {
  return add(ControlKind::label, label, &variable);
}

Control& Form::Button(std::string_view label, std::function<void()> pressed) {
  return add(ControlKind::button, label).Changed(std::move(pressed));
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

Control& Form::DDX_Control(std::string_view label, CV27SetupGridWnd& grid) {
  Control& control = add(ControlKind::grid, label);
  control.grid = &grid;
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

Control& Form::of(const void* variable) {
  const auto found = std::ranges::find_if(controls_, [variable](const Control& control) {
    return std::visit(
        Overloaded{[](std::monostate) { return false; }, [&](const auto* p) { return p == variable; }},
        control.variable);
  });
  return *found;
}

void Form::show(const UnitChoices& units) {
  for (Control& control : controls_) {
    if (const QunUnit* unit = units.unitOf(control.itemCode); unit != nullptr) control.unit = unit->symbol;
    std::visit(Overloaded{[](std::monostate) {},
                          [&](const std::int32_t* value) {
                            control.index = *value;
                            if (!isIndexed(control))
                              control.text = control.itemCode == 0 ? std::to_string(*value)
                                                                   : shownText(*value, control, units);
                          },
                          [&](const float* value) { control.text = shownText(*value, control, units); },
                          [&](const double* value) { control.text = shownText(*value, control, units); },
                          [&](const std::string* value) { control.text = *value; }},
               control.variable);
  }
}

Control& Form::DDX_VdText(std::string_view label, std::int32_t& variable, int itemCode) {
  Control& control = DDX_Text(label, variable);
  control.itemCode = itemCode;
  return control;
}

std::string Form::store(const UnitChoices& units) {
  for (const Control& control : controls_) {
    if (control.kind == ControlKind::text && !isValid(control))
      return fmt::format("{} \"{}\" is not a number", control.label, control.text);
  }
  for (const Control& control : controls_) {
    if (control.kind != ControlKind::text && !isIndexed(control)) continue;
    std::visit(Overloaded{[](std::monostate) {},
                          [&](std::int32_t* value) {
                            if (isIndexed(control)) {
                              *value = control.index;
                            } else if (control.itemCode == 0) {
                              *value = *int32OfText(trimmed(control.text));
                            } else if (control.text != shownText(*value, control, units)) {
                              *value = roundedToInt32(*realOf<double>(control, units));
                            }
                          },
                          // A text that still shows the value keeps all of its digits.
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
  return {};
}

}  // namespace gridbay
