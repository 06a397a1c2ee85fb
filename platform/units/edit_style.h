#pragma once

#include <map>
#include <string>
#include <string_view>

#include "platform/units/units.h"

namespace gridbay {

// The units in which the user wants to see quantities: a system for all, and single choices over it.
class UnitChoices {
 public:
  void setSystem(UnitSystem system) { system_ = system; }
  UnitSystem system() const { return system_; }
  void choose(int itemCode, int unitCode) { chosen_[itemCode] = unitCode; }

  // The unit shown for an item; null for an item that is not in the catalogue.
  const QunUnit* unitOf(int itemCode) const;

 private:
  UnitSystem system_ = UnitSystem::metric;
  std::map<int, int> chosen_;
};

// How a number with a unit is shown and edited. A short-lived value.
class CVdEditStyle {
 public:
  explicit CVdEditStyle(const UnitChoices& choices) : choices_(&choices) {}

  // The quantity, by its item code.
  CVdEditStyle& SetQunUnitBaseGroup(int itemCode);
  // The printf format of the number.
  CVdEditStyle& SetFormat(std::string_view format);

  // With `toDisplay` 1 a stored value in the unit that the user has chosen, with 0 a typed value in base
  // units.
  double UnitConvertFromBase(double value, int toDisplay) const;
  // The number in the unit shown, by the format.
  std::string Text(double baseValue) const;
  // "Water level [m]"
  std::string GetQunToolTipText() const;

 private:
  const UnitChoices* choices_;
  int itemCode_ = item::kUndefined;
  std::string format_ = "%-lf";
};

}  // namespace gridbay
