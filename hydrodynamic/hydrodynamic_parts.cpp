#include "hydrodynamic/hydrodynamic_parts.h"

#include "hydrodynamic/boundary.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"

namespace gridbay {

HydrodynamicParts::HydrodynamicParts() = default;
HydrodynamicParts::~HydrodynamicParts() = default;

}  // namespace gridbay
