#include "mud_transport/result.h"

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/result.h"
#include "mud_transport/task_selection.h"
#include "mud_transport/transported.h"

namespace gridbay {

bool CNmtResultKvs::hydrodynamicHotStart() {
  auto* flow = parts<HydrodynamicParts>();
  return flow != nullptr && flow->nhdResult->generateHotStart;
}

int CNmtResultKvs::valuesAtPoint(const CNmtResultObjectKvs&) {
  return includeLayers != 0 ? itemsOfHotStart() : MudFractions::count(*this);
}

int CNmtResultKvs::itemsOfHotStart() {
  const CNmtTaskSelectionKvs* task = mudTaskOf(*this);
  return task == nullptr ? 0 : task->EntryCount();
}

}  // namespace gridbay
