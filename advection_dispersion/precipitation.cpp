#include "advection_dispersion/precipitation.h"

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/source_sink.h"

namespace gridbay {

bool CNadPrecipitationKvs::Applies() {
  auto* flow = parts<HydrodynamicParts>();
  return flow != nullptr && flow->nhdSourceSink->HasPrecipitation();
}

}  // namespace gridbay
