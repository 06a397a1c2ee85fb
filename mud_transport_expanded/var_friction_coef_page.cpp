#include "mud_transport_expanded/var_friction_coef_page.h"

#include "platform/units/units.h"

namespace gridbay {

void CNmtExpVarFrictionCoefDlg::DoDataExchange(Form& form) {
  form.Number("Solid density", objectOf(&MudTransportExpandedParts::nmtExpVarFrictionCoef),
              &CNmtExpVarFrictionCoefKvs::solidDensity, item::kBedDensity);
  form.Grid("Variable friction coefficient", grid_);
}

}  // namespace gridbay
