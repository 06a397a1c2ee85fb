#include "mud_transport_expanded/water_col_parameters_page.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/sand_fractions.h"
#include "mud_transport_expanded/water_col_parameters.h"

namespace gridbay {

bool CNmtExpSandFractionGrid::IsEnabled() {
  return parts<MudTransportExpandedParts>().nmtExpSandFractions->hasSand();
}

void CNmtExpSandFractionGrid::LayOut() {
  const auto fraction = RowsOf(&MudTransportExpandedParts::nmtExpSandFractions);
  Check("Sand", 60, fraction, &CNmtExpSandFractionObjectKvs::isSand);
}

void CNmtExpWaterColParametersDlg::DoDataExchange(Form& form) {
  const auto water = objectOf(&MudTransportExpandedParts::nmtExpWaterColParameters);
  form.Group("Viscosity", [&] {
    form.Number("C1Visc", water, &CNmtExpWaterColParametersKvs::c1Visc);
    form.Number("C2Visc", water, &CNmtExpWaterColParametersKvs::c2Visc);
  });
  form.Check("Include sand fractions", objectOf(&MudTransportExpandedParts::nmtExpSandFractions),
             &CNmtExpSandFractionsKvs::sandFractionDescription);
  form.Grid("Sand fractions", grid_);
}

}  // namespace gridbay
