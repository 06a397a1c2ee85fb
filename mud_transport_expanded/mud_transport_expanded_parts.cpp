#include "mud_transport_expanded/mud_transport_expanded_parts.h"

#include "core/model_root.h"
#include "core/table_code.h"
#include "mud_transport_expanded/bed_density.h"
#include "mud_transport_expanded/bed_roughness.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/const_friction_coef.h"
#include "mud_transport_expanded/critical_shear_stress.h"
#include "mud_transport_expanded/deposition.h"
#include "mud_transport_expanded/dispersion_coef.h"
#include "mud_transport_expanded/dredgings.h"
#include "mud_transport_expanded/erosion_coefficient.h"
#include "mud_transport_expanded/erosion_layer.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/mass_budget.h"
#include "mud_transport_expanded/morphology.h"
#include "mud_transport_expanded/power_of_erosion.h"
#include "mud_transport_expanded/result.h"
#include "mud_transport_expanded/sand_fractions.h"
#include "mud_transport_expanded/settling_par.h"
#include "mud_transport_expanded/settlings.h"
#include "mud_transport_expanded/sliding.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/starting_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/transition.h"
#include "mud_transport_expanded/var_friction_coef.h"
#include "mud_transport_expanded/water_col_parameters.h"
#include "mud_transport_expanded/wave_database.h"
#include "mud_transport_expanded/waves.h"

namespace gridbay {

MudTransportExpandedParts::MudTransportExpandedParts() = default;
MudTransportExpandedParts::~MudTransportExpandedParts() = default;

void MudTransportExpandedParts::create(CKvsBase& root) {
  makeMembers(root, nmtExpStartingConditions, nmtExpTaskSelection, nmtExpInitialConditions,
              nmtExpDispersionCoef, nmtExpBoundary, nmtExpForcings, nmtExpWaves, nmtExpTsvWaves,
              nmtExpConstantWaves, nmtExpWaveDatabase, nmtExpDredgings, nmtExpSources,
              nmtExpWaterColParameters, nmtExpSandFractions, nmtExpSettlings, nmtExpDeposition,
              nmtExpSettlingPar, nmtExpErosionLayer, nmtExpPowerOfErosion, nmtExpErosionCoefficient,
              nmtExpCriticalShearStress, nmtExpBedDensity, nmtExpSliding, nmtExpConstFrictionCoef,
              nmtExpMorphology, nmtExpVarFrictionCoef, nmtExpBedRoughness, nmtExpTransition, nmtExpMassBudget,
              nmtExpLineDischarge, nmtExpResult);
}

// Of these nothing calls what they put something else in the place of; a debug build looks for it.
template class TableKvs<CNmtExpSandFractionObjectKvs>;
template class TableKvs<CNmtExpWaterColParametersKvs>;

}  // namespace gridbay
