#include "families/starting_conditions.h"

#include "basic/simulation_period.h"
#include "families/texts.h"

namespace gridbay {

std::int32_t lastTimeStep(CKvsBase& object) {
  auto* basic = object.parts<BasicParts>();
  return basic == nullptr ? 0 : basic->simulationPeriod->LastTimeStep();
}

bool isHotModel(CKvsBase& object) {
  auto* basic = object.parts<BasicParts>();
  return basic != nullptr && basic->bathymetry->hotStart == 1;
}

unsigned checkTimeSteps(CKvsBase& object, ValidationList& messages, PageId page, std::int32_t first,
                        std::int32_t last) {
  const auto fault = [&](const Text& text) { return report(messages, page, Severity::fault, text); };
  unsigned faults = 0;
  if (first < 0) faults += fault(texts::firstTimeStepNegative);
  if (first > last) faults += fault(texts::firstTimeStepAfterLast);
  if (last > lastTimeStep(object)) faults += fault(texts::lastTimeStepOutOfRange);
  return faults;
}

}  // namespace gridbay
