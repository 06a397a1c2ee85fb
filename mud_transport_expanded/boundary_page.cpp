#include "mud_transport_expanded/boundary_page.h"

#include "mud_transport_expanded/boundary.h"

namespace gridbay {

CNmtExpBoundaryDlg::CNmtExpBoundaryDlg(CVdDoc& document) : BoundaryValuesDlg(document) {}
CNmtExpBoundaryDlg::~CNmtExpBoundaryDlg() = default;

}  // namespace gridbay
