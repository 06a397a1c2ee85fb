#include "advection_dispersion/evaporation.h"

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/source_sink.h"

namespace gridbay {

bool CNadEvaporationKvs::Applies() {
  auto* flow = parts<HydrodynamicParts>();
  return flow != nullptr && flow->nhdSourceSink->HasEvaporation();
}

}  // namespace gridbay
