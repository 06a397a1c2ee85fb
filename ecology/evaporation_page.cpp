#include "ecology/evaporation_page.h"

#include "ecology/evaporation.h"

namespace gridbay {

CWQSADEvaporationDlg::CWQSADEvaporationDlg(CVdDoc& document) : SurfaceValuesDlg(document) {}
CWQSADEvaporationDlg::~CWQSADEvaporationDlg() = default;

}  // namespace gridbay
