#include "platform/units/edit_style.h"

#include <fmt/printf.h>

namespace gridbay {

const QunUnit* UnitChoices::unitOf(int itemCode) const {
  const QunItem* found = qunFindItem(itemCode);
  if (found == nullptr) return nullptr;
  if (const auto chosen = chosen_.find(itemCode); chosen != chosen_.end()) return qunFindUnit(chosen->second);
  return qunFindUnit(system_ == UnitSystem::us ? found->usUnit : found->units.front());
}

CVdEditStyle& CVdEditStyle::SetQunUnitBaseGroup(int itemCode) {
  itemCode_ = itemCode;
  return *this;
}

CVdEditStyle& CVdEditStyle::SetFormat(std::string_view format) {
  format_ = format;
  return *this;
}

double CVdEditStyle::UnitConvertFromBase(double value, int toDisplay) const {
  const QunUnit* base = qunBaseUnit(itemCode_);
  const QunUnit* shown = choices_->unitOf(itemCode_);
  if (base == nullptr || shown == nullptr || base == shown) return value;
  return (toDisplay != 0 ? CVdUnitConverter(base->code, shown->code)
                         : CVdUnitConverter(shown->code, base->code))
      .Convert(value);
}

std::string CVdEditStyle::Text(double baseValue) const {
  return fmt::sprintf(format_, UnitConvertFromBase(baseValue, 1));
}

std::string CVdEditStyle::GetQunToolTipText() const {
  const QunItem* found = qunFindItem(itemCode_);
  const QunUnit* shown = choices_->unitOf(itemCode_);
  if (found == nullptr || shown == nullptr) return {};
  return fmt::sprintf("%s [%s]", found->name, shown->symbol);
}

}  // namespace gridbay
