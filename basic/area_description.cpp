#include "basic/area_description.h"

#include "basic/texts.h"
#include "core/table_code.h"

namespace gridbay {

unsigned CAreaDescriptionKvs::Validate(ValidationList& messages, int) {
  if (enableFloodAndDryChecking == 0) return 0;
  unsigned faults = 0;
  if (dryingDepth > floodingDepth) {
    faults += report(messages, PageId::floodAndDry, Severity::fault, texts::dryingAboveFlooding);
  }
  if (dryingDepth <= 0) {
    faults += report(messages, PageId::floodAndDry, Severity::fault, texts::dryingNotPositive);
  }
  return faults;
}

}  // namespace gridbay
