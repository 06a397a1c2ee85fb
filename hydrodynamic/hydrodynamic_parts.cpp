#include "hydrodynamic/hydrodynamic_parts.h"

#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"

namespace gridbay {

HydrodynamicParts::HydrodynamicParts() = default;
HydrodynamicParts::~HydrodynamicParts() = default;

}  // namespace gridbay
