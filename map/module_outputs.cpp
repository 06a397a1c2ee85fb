#include "map/module_outputs.h"

#include <algorithm>

#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/line_discharge.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/result.h"
#include "basic/module_selection.h"
#include "ecology/mass_budget.h"
#include "ecology/results.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/result.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/mass_budget.h"
#include "mud_transport_expanded/result.h"

namespace gridbay {
namespace {

template <class Results>
ModuleOutputs outputsOf(PageId page, Results& results) {
  return {page, results.outputs.GetCount(), Results::kMostOnPage,
          [&results](int number) -> TransportOutput* { return results.outputs.GetItem(number); },
          [&results](int count) { results.outputs.SetCount(count); }};
}

}  // namespace

ModuleOutputs moduleOutputs(CGlobalKvs& root) {
  switch (root.moduleSelection->simulationType) {
    case module::kAdvectionDispersion:
      return outputsOf(PageId::adResult, *root.nadResult);
    case module::kMudTransport:
      return outputsOf(PageId::mtResult, *root.nmtResult);
    case module::kMudTransportExpanded:
      return outputsOf(PageId::mtExpResult, *root.nmtExpResult);
    case module::kEcological:
      return outputsOf(PageId::ecoResults, *root.wqsResults);
    default:
      return {};
  }
}

TransportOutput* moduleOutput(CGlobalKvs& root, MapFeatureId id) {
  const ModuleOutputs outputs = moduleOutputs(root);
  return static_cast<std::int32_t>(outputs.page) == id.page && outputs.item ? outputs.item(id.number)
                                                                            : nullptr;
}

std::vector<LineOrBoxList*> linesAndBoxes(CGlobalKvs& root) {
  switch (root.moduleSelection->simulationType) {
    case module::kAdvectionDispersion:
      return {root.nadLineDischarge.get(), root.nadBoxSummation.get()};
    case module::kMudTransport:
      return {root.nmtLineDischarge.get(), root.nmtBoxSummation.get()};
    case module::kMudTransportExpanded:
      return {root.nmtExpLineDischarge.get()};
    default:
      return {};
  }
}

MassFileList* massFiles(CGlobalKvs& root) {
  switch (root.moduleSelection->simulationType) {
    case module::kAdvectionDispersion:
      return root.nadMassBudget.get();
    case module::kMudTransportExpanded:
      return root.nmtExpMassBudget.get();
    case module::kEcological:
      return root.wqsMassBudget.get();
    default:
      return nullptr;
  }
}

LineOrBoxList* lineOrBoxList(CGlobalKvs& root, std::int32_t page) {
  const std::vector<LineOrBoxList*> lists = linesAndBoxes(root);
  const auto found = std::ranges::find_if(lists, [page](const LineOrBoxList* list) {
    return static_cast<std::int32_t>(list->kind().page) == page;
  });
  return found == lists.end() ? nullptr : *found;
}

LineOrBox* lineOrBox(CGlobalKvs& root, MapFeatureId id) {
  LineOrBoxList* list = lineOrBoxList(root, id.page);
  return list == nullptr ? nullptr : list->GetLineOrBox(id.number);
}

}  // namespace gridbay
