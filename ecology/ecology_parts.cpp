#include "ecology/ecology_parts.h"

#include "core/model_root.h"
#include "ecology/pending.h"

namespace gridbay {

EcologyParts::EcologyParts() = default;
EcologyParts::~EcologyParts() = default;

void EcologyParts::create(CKvsBase& root) {
  makeMembers(root, wqsModelDefinition, wqsStartingConditions, wqsInitialConditions, wqsAdBoundary,
              wqsAdDispersion, wqsAdSourceSink, wqsAdPrecipitation, wqsAdEvaporation, wqsAdInfiltration,
              wqsAdDeposition, wqsConstants, wqsForcings, wqsMassBudget, wqsResults);
}

}  // namespace gridbay
