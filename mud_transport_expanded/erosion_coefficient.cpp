#include "mud_transport_expanded/erosion_coefficient.h"

#include "mud_transport_expanded/erosion_layer.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/power_of_erosion.h"

namespace gridbay {

using Layer = CNmtExpErosionCoefficientComponentKvs;

std::int32_t* Layer::findDescription(Layer& layer) {
  auto* module = layer.parts<MudTransportExpandedParts>();
  auto* found = module == nullptr ? nullptr : module->nmtExpErosionLayer->GetItem(layer.number());
  return found == nullptr ? nullptr : &found->description;
}

float* Layer::findPower(Layer& layer) {
  auto* module = layer.parts<MudTransportExpandedParts>();
  auto* found = module == nullptr ? nullptr : module->nmtExpPowerOfErosion->GetItem(layer.number());
  return found == nullptr ? nullptr : &found->power;
}

int Layer::number() const {
  auto* layers = dynamic_cast<CNmtExpErosionCoefficientKvs*>(const_cast<Layer*>(this)->GetParent());
  for (int place = 1; layers != nullptr && place <= layers->GetCount(); ++place) {
    if (layers->GetItem(place) == this) return place;
  }
  return 0;
}

}  // namespace gridbay
