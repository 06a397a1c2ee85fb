#include "advection_dispersion/result.h"

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/result.h"

namespace gridbay {

bool CNadResultKvs::hydrodynamicHotStart() {
  auto* flow = parts<HydrodynamicParts>();
  return flow != nullptr && flow->nhdResult->generateHotStart;
}

}  // namespace gridbay
