#include "advection_dispersion/initial_concentration.h"

#include "advection_dispersion/texts.h"
#include "advection_dispersion/transported.h"

namespace gridbay {

unsigned CNadInitialObjectKvs::Validate(ValidationList& messages, int, int component, int area) {
  if (format != kMap) return 0;
  CVdFileSelectorDlg selector;
  RequestDataFile(selector, component, area);
  return checkDataFile(messages, PageId::adInitialConcentration, selector, file);
}

void CNadInitialObjectKvs::RequestDataFile(CVdFileSelectorDlg& selector, int component, int area) {
  requestVaryingMap(selector, *this, area, texts::initialConcentrationRequest,
                    AdComponents::itemQuantity(*this, component));
}

}  // namespace gridbay
