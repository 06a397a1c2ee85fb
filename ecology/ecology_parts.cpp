#include "ecology/ecology_parts.h"

#include "core/model_root.h"
#include "core/table_code.h"
#include "ecology/boundary.h"
#include "ecology/constants.h"
#include "ecology/deposition.h"
#include "ecology/dispersion.h"
#include "ecology/evaporation.h"
#include "ecology/forcings.h"
#include "ecology/infiltration.h"
#include "ecology/initial_conditions.h"
#include "ecology/mass_budget.h"
#include "ecology/model_definition.h"
#include "ecology/precipitation.h"
#include "ecology/results.h"
#include "ecology/source_sink.h"
#include "ecology/starting_conditions.h"

namespace gridbay {

EcologyParts::EcologyParts() = default;
EcologyParts::~EcologyParts() = default;

void EcologyParts::create(CKvsBase& root) {
  makeMembers(root, wqsModelDefinition, wqsStartingConditions, wqsInitialConditions, wqsAdBoundary,
              wqsAdDispersion, wqsAdSourceSink, wqsAdPrecipitation, wqsAdEvaporation, wqsAdInfiltration,
              wqsAdDeposition, wqsConstants, wqsForcings, wqsMassBudget, wqsResults);
}

}  // namespace gridbay
