#include "hydrodynamic/surface_elevation.h"

#include "families/data_files.h"
#include "platform/units/units.h"

namespace gridbay {

void CNhdSurfaceElevationObjectKvs::RequestMap(CVdFileSelectorDlg& selector, int number) {
  requestMap(selector, *this, number, texts::surfaceElevationRequest,
             {item::kWaterLevel, item::kSurfaceElevation});
}

unsigned CNhdSurfaceElevationObjectKvs::Validate(ValidationList& messages, int, int number) {
  if (type == kConstant) return 0;
  if (type != kFromFile)
    return report(messages, PageId::surfaceElevation, Severity::fault, texts::surfaceElevationType);
  CVdFileSelectorDlg selector;
  RequestMap(selector, number);
  return checkDataFile(messages, PageId::surfaceElevation, selector, map);
}

}  // namespace gridbay
