#include "mud_transport_expanded/erosion_layer_page.h"

#include "mud_transport_expanded/erosion_layer.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "platform/units/units.h"

namespace gridbay {

void CNmtExpErosionDescriptionGrid::LayOut() {
  using Layer = CNmtExpErosionDescriptionObjectKvs;
  const auto layer = RowsOf(&MudTransportExpandedParts::nmtExpErosionLayer);
  List("Erosion", 120, layer, &Layer::description,
       Choices{{Layer::kDense, "Dense bed"}, {Layer::kSoft, "Soft bed"}});
}

void CNmtExpErosionLayer::DoDataExchange(Form& form) {
  form.Number("Maximum concentration allowed due to erosion",
              objectOf(&MudTransportExpandedParts::nmtExpErosionLayer), &CNmtExpErosionLayerKvs::cMax,
              item::kSuspendedSediment);
  form.Grid("Layers", grid_);
}

}  // namespace gridbay
