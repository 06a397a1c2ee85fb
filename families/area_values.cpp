#include "families/area_values.h"

namespace gridbay {

int areaCount(CKvsBase& object) {
  auto* basic = object.parts<BasicParts>();
  return basic == nullptr ? 0 : basic->bathymetry->GetCount();
}

}  // namespace gridbay
