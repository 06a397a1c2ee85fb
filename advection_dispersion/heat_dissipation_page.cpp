#include "advection_dispersion/heat_dissipation_page.h"

#include "advection_dispersion/heat_dissipation.h"

namespace gridbay {

CNadHeatDissipationDlg::CNadHeatDissipationDlg(CVdDoc& document) : ComponentCoefficientsDlg(document) {}
CNadHeatDissipationDlg::~CNadHeatDissipationDlg() = default;

}  // namespace gridbay
