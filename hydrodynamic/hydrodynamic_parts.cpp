#include "hydrodynamic/hydrodynamic_parts.h"

#include "hydrodynamic/boundary.h"

namespace gridbay {

HydrodynamicParts::HydrodynamicParts() = default;
HydrodynamicParts::~HydrodynamicParts() = default;

}  // namespace gridbay
