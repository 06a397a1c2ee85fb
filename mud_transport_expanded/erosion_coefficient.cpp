#include "mud_transport_expanded/erosion_coefficient.h"

#include "mud_transport_expanded/erosion_layer.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/power_of_erosion.h"

namespace gridbay {

using Coefficient = CNmtExpErosionCoefficientComponentKvs;

std::int32_t* Coefficient::findDescription(Coefficient& coefficient) {
  auto* module = coefficient.parts<MudTransportExpandedParts>();
  auto* found = module == nullptr ? nullptr : module->nmtExpErosionLayer->GetItem(coefficient.number());
  return found == nullptr ? nullptr : &found->description;
}

float* Coefficient::findPower(Coefficient& coefficient) {
  auto* module = coefficient.parts<MudTransportExpandedParts>();
  auto* found = module == nullptr ? nullptr : module->nmtExpPowerOfErosion->GetItem(coefficient.number());
  return found == nullptr ? nullptr : &found->power;
}

int Coefficient::number() const {
  auto* layers = dynamic_cast<CNmtExpErosionCoefficientKvs*>(const_cast<Coefficient*>(this)->GetParent());
  for (int place = 1; layers != nullptr && place <= layers->GetCount(); ++place) {
    if (layers->GetItem(place) == this) return place;
  }
  return 0;
}

}  // namespace gridbay
