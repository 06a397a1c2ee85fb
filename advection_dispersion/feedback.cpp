#include "advection_dispersion/feedback.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"
#include "core/table_code.h"

namespace gridbay {

unsigned CNadFeedbackKvs::Validate(ValidationList& messages, int) {
  if (!isIncluded) return 0;
  auto* module = parts<AdvectionDispersionParts>();
  const auto exists = [module](std::int32_t number) {
    return module != nullptr && module->nadComponent->GetItem(number) != nullptr;
  };
  const auto fault = [&messages](const Text& text) {
    return report(messages, PageId::adFeedback, Severity::fault, text);
  };
  const bool salinityVaries = salinityDescription == kVarying;
  const bool temperatureVaries = temperatureDescription == kVarying;
  unsigned faults = 0;
  if (salinityDescription == kConstant && temperatureDescription == kConstant)
    faults += fault(texts::nothingVaries);
  if (salinityVaries && temperatureVaries && salinityComponent == temperatureComponent)
    faults += fault(texts::sameFeedbackItem);
  if (salinityVaries && !exists(salinityComponent)) faults += fault(texts::invalidSalinity);
  if (temperatureVaries && !exists(temperatureComponent)) faults += fault(texts::invalidTemperature);
  return faults;
}

}  // namespace gridbay
