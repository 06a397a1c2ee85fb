#include "mud_transport/ml_settling_and_deposition_page.h"

#include "mud_transport/ml_settling_and_deposition.h"
#include "mud_transport/mud_transport_parts.h"
#include "platform/units/units.h"

namespace gridbay {

void CNmtMlShearStressGrid::LayOut() {
  MapColumns([this] { return &parts<MudTransportParts>().nmtMlSettlingAndDeposition->shearStress; });
}

void CNmtMlSettlingAndDepositionDlg::DoDataExchange(Form& form) {
  using Settling = CNmtMlSettlingAndDepositionKvs;
  const auto settling = objectOf(&MudTransportParts::nmtMlSettlingAndDeposition);
  form.Group("Sediment profile", [&] {
    form.Radio("Profile",
               Choices{{Settling::kStationary, "Use stationary concentration profile"},
                       {Settling::kDynamic, "Use dynamic concentration profile"}},
               settling, &Settling::stationaryProfile);
    form.Number("Relative height of centroid [-]", settling, &Settling::relativeHeightOfCentroid);
  });
  form.Group("Settling velocity", [&] {
    form.Number("Factor kon1 [-]", settling, &Settling::factorKon1);
    form.Number("Factor kon2 [-]", settling, &Settling::factorKon2);
    form.Number("Power M1 [-]", settling, &Settling::powerM1);
    form.Number("Power M2 [-]", settling, &Settling::powerM2);
    form.Number("Power B1 [-]", settling, &Settling::powerB1);
    form.Number("Power B2 [-]", settling, &Settling::powerB2);
    form.Number("Concentration limit C1", settling, &Settling::concentrationC1, item::kConcentration);
    form.Number("Concentration limit C2", settling, &Settling::concentrationC2, item::kConcentration);
    form.Number("Salinity limit 1", settling, &Settling::salinityLimit1);
    form.Number("Salinity limit 2", settling, &Settling::salinityLimit2);
  });
  form.Group("Deposition", [&] {
    form.Check("Use factor for deposition", settling, &Settling::useFactorForDeposition);
    form.Number("Factor for deposition [-]", settling, &Settling::factorForDeposition).EnabledIf([settling] {
      return settling().useFactorForDeposition != 0;
    });
  });
  form.Group("Critical shear stress for deposition", [&] {
    const auto shearStress = [settling]() -> DepositionShearStressKvs& { return settling().shearStress; };
    listConstantOrMaps(form, "Critical shear stress", item::kShearStress, shearStress, grid_);
  });
}

}  // namespace gridbay
