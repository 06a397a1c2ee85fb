#include "hydrodynamic/hydrodynamic_parts.h"

#include "core/model_root.h"
#include "core/table_code.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wave_radiation.h"
#include "hydrodynamic/wind_conditions.h"

namespace gridbay {

HydrodynamicParts::HydrodynamicParts() = default;
HydrodynamicParts::~HydrodynamicParts() = default;

void HydrodynamicParts::create(CKvsBase& root) {
  makeMembers(root, nhdBoundary, nhdSourceSink, nhdInfiltration, windConditions, nhdEddyViscosity,
              nhdWaveRadiation, nhdSurfaceElevation, nhdResistance, nhdResult);
}

}  // namespace gridbay
