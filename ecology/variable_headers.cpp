#include "ecology/variable_headers.h"

namespace gridbay {

std::string rangeTip(const CSolverItem* declared, const UnitChoices& units) {
  if (declared == nullptr) return {};
  CVdEditStyle style(units);
  style.SetQunUnitBaseGroup(declared->Quantity());
  return formatted(texts::valueRange, style.UnitConvertFromBase(declared->minimum, 1),
                   style.UnitConvertFromBase(declared->maximum, 1));
}

std::string unitText(const CSolverItem* declared, const UnitChoices& units) {
  if (declared == nullptr) return {};
  const QunUnit* shown = units.unitOf(declared->Quantity());
  return shown == nullptr ? declared->unit : std::string(shown->symbol);
}

std::string unitTip(const CSolverItem* declared, const UnitChoices& units) {
  if (declared == nullptr) return {};
  return CVdEditStyle(units).SetQunUnitBaseGroup(declared->Quantity()).GetQunToolTipText();
}

}  // namespace gridbay
