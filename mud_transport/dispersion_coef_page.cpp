#include "mud_transport/dispersion_coef_page.h"

#include "mud_transport/dispersion_coef.h"

namespace gridbay {

CNmtDispersionCoefDlg::CNmtDispersionCoefDlg(CVdDoc& document) : DispersionCoefDlg(document) {}
CNmtDispersionCoefDlg::~CNmtDispersionCoefDlg() = default;

}  // namespace gridbay
