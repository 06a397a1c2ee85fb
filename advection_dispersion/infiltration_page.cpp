#include "advection_dispersion/infiltration_page.h"

#include "advection_dispersion/infiltration.h"

namespace gridbay {

CNadInfiltrationDlg::CNadInfiltrationDlg(CVdDoc& document) : SurfaceValuesDlg(document) {}
CNadInfiltrationDlg::~CNadInfiltrationDlg() = default;

}  // namespace gridbay
