#include "mud_transport_expanded/settling_par.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/settlings.h"

namespace gridbay {

float CNmtExpSettlingParKvs::newValue(int) {
  constexpr float kVelocity = 0.0005F;
  constexpr float kCoefficient = 5;
  auto* module = parts<MudTransportExpandedParts>();
  return module == nullptr || module->nmtExpSettlings->isConstant() ? kVelocity : kCoefficient;
}

}  // namespace gridbay
