#include "ecology/boundary_page.h"

#include "ecology/boundary.h"

namespace gridbay {

CWQSADBoundaryDlg::CWQSADBoundaryDlg(CVdDoc& document) : BoundaryValuesDlg(document) {}
CWQSADBoundaryDlg::~CWQSADBoundaryDlg() = default;

}  // namespace gridbay
