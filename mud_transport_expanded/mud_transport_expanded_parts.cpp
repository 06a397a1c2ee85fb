#include "mud_transport_expanded/mud_transport_expanded_parts.h"

#include "core/model_root.h"
#include "mud_transport_expanded/pending.h"

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

}  // namespace gridbay
