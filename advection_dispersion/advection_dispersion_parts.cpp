#include "advection_dispersion/advection_dispersion_parts.h"

namespace gridbay {

AdvectionDispersionParts::AdvectionDispersionParts() = default;
AdvectionDispersionParts::~AdvectionDispersionParts() = default;

}  // namespace gridbay
