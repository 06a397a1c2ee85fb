#include "ecology/precipitation_page.h"

#include "ecology/precipitation.h"

namespace gridbay {

CWQSADPrecipitationDlg::CWQSADPrecipitationDlg(CVdDoc& document) : SurfaceValuesDlg(document) {}
CWQSADPrecipitationDlg::~CWQSADPrecipitationDlg() = default;

}  // namespace gridbay
