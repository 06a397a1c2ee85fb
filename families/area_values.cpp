#include "families/area_values.h"

namespace gridbay {

int areaCount(CKvsBase& object) {
  auto* basic = object.parts<BasicParts>();
  return basic == nullptr ? 0 : basic->bathymetry->GetCount();
}

void requestAnyMap(CVdFileSelectorDlg& selector, CKvsBase& object, int number, const Text& description) {
  requestMap(selector, object, number, description, {});
  requestSimulationPeriod(selector, object);
  selector.AllowOneTimeStep();
}

}  // namespace gridbay
