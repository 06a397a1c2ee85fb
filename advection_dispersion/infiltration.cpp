#include "advection_dispersion/infiltration.h"

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/source_sink.h"

namespace gridbay {

bool CNadInfiltrationKvs::Applies() {
  auto* flow = parts<HydrodynamicParts>();
  return flow != nullptr && flow->nhdSourceSink->HasEvaporation();
}

}  // namespace gridbay
