#include "hydrodynamic/eddy_viscosity.h"

#include "families/data_files.h"
#include "platform/units/units.h"

namespace gridbay {

void CNhdEddyViscosityObjectKvs::RequestMap(CVdFileSelectorDlg& selector, int number) {
  requestMap(selector, *this, number, texts::eddyViscosityRequest, {item::kEddyViscosity});
}

unsigned CNhdEddyViscosityObjectKvs::Validate(ValidationList& messages, int, int number) {
  const auto* list = dynamic_cast<const CNhdEddyViscosityKvs*>(GetParent());
  if (list == nullptr) return 0;
  if (list->dataFormat == CNhdEddyViscosityKvs::kConstant && constantValue < 0)
    return report(messages, PageId::eddyViscosity, Severity::fault, texts::negativeEddyViscosity);
  if (list->dataFormat != CNhdEddyViscosityKvs::kFromFile) return 0;
  CVdFileSelectorDlg selector;
  RequestMap(selector, number);
  return checkDataFile(messages, PageId::eddyViscosity, selector, map);
}

}  // namespace gridbay
