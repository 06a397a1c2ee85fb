#include "mud_transport/erosion_characteristics_page.h"

#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/mud_transport_parts.h"

namespace gridbay {

void CNmtMfErosionCharacteristicsDlg::DoDataExchange(Form& form) {
  using Erosion = CNmtMfErosionCharacteristicsKvs;
  const auto erosion = objectOf(&MudTransportParts::nmtMfErosionCharacteristics);
  form.Group("Settings", [&] {
    form.Check("Bed is erodible", erosion, &Erosion::bedIsErodible);
    form.Check("Deposited sediment is erodible", erosion, &Erosion::depositedSedimentErodible);
  });
  form.Group("Calculation method", [&] {
    form.Radio("Sediment", Choices{{1, "Only cohesive sediment"}, {0, "Cohesive and non cohesive sediment"}},
               erosion, &Erosion::onlyCohesiveSediment);
    form.Number("Scale factor", erosion, &Erosion::scaleFactor);
  });
}

void CNmtMlErosionCharacteristicsDlg::DoDataExchange(Form& form) {
  using Erosion = CNmtMlErosionCharacteristicsKvs;
  const auto erosion = objectOf(&MudTransportParts::nmtMlErosionCharacteristics);
  form.Check("Include instantaneous erosion of layer 1", erosion, &Erosion::instantaneousErosionOfLayer1);
  form.Radio("Erosion coefficients",
             Choices{{1, "Use constant erosion coefficients"}, {0, "Use variable erosion coefficients"}},
             erosion, &Erosion::useConstantErosionCoefficient);
}

void CNmtErosionLayerGrid::LayOut() {
  using Layer = CNmtErosionLayerObjectKvs;
  const auto layer = RowsOf(&MudTransportParts::nmtErosionLayer);
  List("Erosion of", 110, layer, &Layer::isDense,
       Choices{{Layer::kDense, "Dense bed"}, {Layer::kSoft, "Soft bed"}});
}

}  // namespace gridbay
