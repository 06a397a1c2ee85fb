#include "ecology/deposition_page.h"

namespace gridbay {

CWQSADDepositionDlg::CWQSADDepositionDlg(CVdDoc& document) : DepositionDlg(document) {}
CWQSADDepositionDlg::~CWQSADDepositionDlg() = default;

}  // namespace gridbay
