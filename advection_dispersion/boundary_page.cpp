#include "advection_dispersion/boundary_page.h"

#include "advection_dispersion/boundary.h"

namespace gridbay {

CNadBoundaryDlg::CNadBoundaryDlg(CVdDoc& document) : BoundaryValuesDlg(document) {}
CNadBoundaryDlg::~CNadBoundaryDlg() = default;

}  // namespace gridbay
