#include "mud_transport/mud_transport_parts.h"

#include "core/model_root.h"
#include "core/table_code.h"
#include "mud_transport/bed_roughness.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/consolidation.h"
#include "mud_transport/dispersion_coef.h"
#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/erosion_for_each_layer.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/ml_settling_and_deposition.h"
#include "mud_transport/result.h"
#include "mud_transport/settling_and_desposition.h"
#include "mud_transport/sliding.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/starting_conditions.h"
#include "mud_transport/task_selection.h"
#include "mud_transport/transition_between_layers.h"
#include "mud_transport/wave_data.h"

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
