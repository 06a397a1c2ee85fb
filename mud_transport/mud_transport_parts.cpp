#include "mud_transport/mud_transport_parts.h"

#include "core/model_root.h"
#include "mud_transport/pending.h"

namespace gridbay {

MudTransportParts::MudTransportParts() = default;
MudTransportParts::~MudTransportParts() = default;

void MudTransportParts::create(CKvsBase& root) {
  makeMembers(root, nmtStartingConditions, nmtTaskSelection, nmtInitialConcentration, nmtDispersionCoef,
              nmtSettlingAndDesposition, nmtMlSettlingAndDeposition, nmtBoundary, nmtSourceSink,
              nmtMfErosionCharacteristics, nmtMlErosionCharacteristics, nmtErosionLayer,
              nmtErosionForEachLayerCritical, nmtErosionForEachLayerFactor, nmtErosionForEachLayerFactor1,
              nmtErosionForEachLayerFactor2, nmtErosionForEachLayerPower, nmtErosionForEachLayerDensity,
              nmtSliding, nmtTransitionBetweenLayers, nmtConsolidation, nmtBedRoughness, nmtWaveData,
              nmtLineDischarge, nmtBoxSummation, nmtResult);
}

}  // namespace gridbay
