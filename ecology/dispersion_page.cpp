#include "ecology/dispersion_page.h"

#include "ecology/dispersion.h"

namespace gridbay {

CWQSADDispersionDlg::CWQSADDispersionDlg(CVdDoc& document) : DispersionCoefDlg(document) {}
CWQSADDispersionDlg::~CWQSADDispersionDlg() = default;

}  // namespace gridbay
