#include "advection_dispersion/precipitation_page.h"

#include "advection_dispersion/precipitation.h"

namespace gridbay {

CNadPrecipitationDlg::CNadPrecipitationDlg(CVdDoc& document) : SurfaceValuesDlg(document) {}
CNadPrecipitationDlg::~CNadPrecipitationDlg() = default;

}  // namespace gridbay
