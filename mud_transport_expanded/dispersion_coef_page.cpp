#include "mud_transport_expanded/dispersion_coef_page.h"

#include "mud_transport_expanded/dispersion_coef.h"

namespace gridbay {

CNmtExpDispersionCoefDlg::CNmtExpDispersionCoefDlg(CVdDoc& document) : DispersionCoefDlg(document) {}
CNmtExpDispersionCoefDlg::~CNmtExpDispersionCoefDlg() = default;

}  // namespace gridbay
