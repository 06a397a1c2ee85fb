#include "advection_dispersion/evaporation_page.h"

#include "advection_dispersion/evaporation.h"

namespace gridbay {

CNadEvaporationDlg::CNadEvaporationDlg(CVdDoc& document) : SurfaceValuesDlg(document) {}
CNadEvaporationDlg::~CNadEvaporationDlg() = default;

}  // namespace gridbay
