#include "families/mass_budget.h"

#include "basic/basic_parts.h"
#include "basic/mass_budget.h"

namespace gridbay {

unsigned checkMassFile(ValidationList& messages, CKvsBase& object, PageId page, const MassFile& item) {
  auto* basic = object.parts<BasicParts>();
  const int polygons = basic == nullptr ? 0 : basic->massBudget->GetCount();
  const std::int32_t lastStep = lastTimeStep(object);
  const USubLine& steps = item.steps;
  const bool isInTime = 0 <= steps.first && steps.first <= lastStep && 0 <= steps.last &&
                        steps.last <= lastStep && steps.interval >= 1 && steps.first <= steps.last;
  unsigned faults = 0;
  const auto check = [&](bool isWrong, const Text& text) {
    if (isWrong) faults += report(messages, page, Severity::fault, text);
  };
  check(item.polygon < 1 || item.polygon > polygons, texts::invalidPolygon);
  check(!isInTime, texts::timeRangeOutOfRange);
  check(chosenCount(item.entries) + chosenCount(item.variables) == 0, texts::noItemSelected);
  check(item.file.empty(), texts::noOutputFile);
  return faults;
}

}  // namespace gridbay
