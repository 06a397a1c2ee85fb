#include "ecology/infiltration_page.h"

#include "ecology/infiltration.h"

namespace gridbay {

CWQSADInfiltrationDlg::CWQSADInfiltrationDlg(CVdDoc& document) : SurfaceValuesDlg(document) {}
CWQSADInfiltrationDlg::~CWQSADInfiltrationDlg() = default;

}  // namespace gridbay
