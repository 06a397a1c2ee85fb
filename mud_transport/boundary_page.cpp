#include "mud_transport/boundary_page.h"

#include "mud_transport/boundary.h"

namespace gridbay {

CNmtBoundaryDlg::CNmtBoundaryDlg(CVdDoc& document) : BoundaryValuesDlg(document) {}
CNmtBoundaryDlg::~CNmtBoundaryDlg() = default;

}  // namespace gridbay
