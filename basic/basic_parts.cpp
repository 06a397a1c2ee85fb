#include "basic/basic_parts.h"

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/model_root.h"
#include "core/table_code.h"

namespace gridbay {

BasicParts::BasicParts() = default;
BasicParts::~BasicParts() = default;

void BasicParts::create(CKvsBase& root) {
  makeMembers(root, moduleSelection, bathymetry, simulationPeriod, boundary, sourceSink, massBudget,
              areaDescription);
}

}  // namespace gridbay
