#include "advection_dispersion/advection_dispersion_parts.h"

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/decay_specification.h"
#include "advection_dispersion/deposition_concentration.h"
#include "advection_dispersion/dispersion_coef.h"
#include "advection_dispersion/evaporation.h"
#include "advection_dispersion/feedback.h"
#include "advection_dispersion/heat_dissipation.h"
#include "advection_dispersion/heat_exchange.h"
#include "advection_dispersion/infiltration.h"
#include "advection_dispersion/initial_concentration.h"
#include "advection_dispersion/line_discharge.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/precipitation.h"
#include "advection_dispersion/result.h"
#include "advection_dispersion/source_sink.h"
#include "advection_dispersion/starting_conditions.h"
#include "core/model_root.h"
#include "core/table_code.h"

namespace gridbay {

AdvectionDispersionParts::AdvectionDispersionParts() = default;
AdvectionDispersionParts::~AdvectionDispersionParts() = default;

void AdvectionDispersionParts::create(CKvsBase& root) {
  makeMembers(root, nadComponent, nadStartingConditions, nadInitialConcentration, nadDispersionCoef,
              nadDecaySpecification, nadHeatDissipation, nadBoundary, nadSourceSink,
              nadDepositionConcentration, nadHeatExchange, nadPrecipitation, nadEvaporation, nadInfiltration,
              nadFeedback, nadLineDischarge, nadBoxSummation, nadMassBudget, nadResult);
}

}  // namespace gridbay
