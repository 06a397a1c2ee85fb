#include "advection_dispersion/decay_specification_page.h"

#include "advection_dispersion/decay_specification.h"

namespace gridbay {

CNadDecaySpecificationDlg::CNadDecaySpecificationDlg(CVdDoc& document) : ComponentCoefficientsDlg(document) {}
CNadDecaySpecificationDlg::~CNadDecaySpecificationDlg() = default;

}  // namespace gridbay
