#include "advection_dispersion/dispersion_coef_page.h"

#include "advection_dispersion/dispersion_coef.h"

namespace gridbay {

CNadDispersionCoefDlg::CNadDispersionCoefDlg(CVdDoc& document) : DispersionCoefDlg(document) {}
CNadDispersionCoefDlg::~CNadDispersionCoefDlg() = default;

}  // namespace gridbay
