#include "mud_transport_expanded/transported.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/texts.h"
#include "platform/units/units.h"

namespace gridbay {

CNmtExpTaskSelectionKvs* expandedCountsOf(CKvsBase& object) {
  auto* module = object.parts<MudTransportExpandedParts>();
  return module == nullptr ? nullptr : module->nmtExpTaskSelection.get();
}

bool carriesSalinity(CKvsBase& object) {
  const CNmtExpTaskSelectionKvs* counts = expandedCountsOf(object);
  return counts != nullptr && counts->includeSalinity;
}

int fractionCount(CKvsBase& object) {
  const CNmtExpTaskSelectionKvs* counts = expandedCountsOf(object);
  return counts == nullptr ? 0 : counts->fractions;
}

int layerCount(CKvsBase& object) {
  const CNmtExpTaskSelectionKvs* counts = expandedCountsOf(object);
  return counts == nullptr ? 0 : counts->layers;
}

int ExpandedMudEntries::count(CKvsBase& object) {
  return fractionCount(object) + (carriesSalinity(object) ? 1 : 0);
}

std::string ExpandedMudEntries::name(CKvsBase& object, int position) {
  const int fraction = position - (carriesSalinity(object) ? 1 : 0);
  if (fraction == 0) return formatted(texts::salinityEntry);
  const int fractions = fractionCount(object);
  return fraction <= fractions ? formatted(texts::fractionEntry, fraction)
                               : formatted(texts::layerEntry, fraction - fractions);
}

int ExpandedMudEntries::quantity(CKvsBase& object, int position) {
  const int fraction = position - (carriesSalinity(object) ? 1 : 0);
  if (fraction == 0) return item::kSalinity;
  return fraction <= fractionCount(object) ? item::kSuspendedSediment : item::kLayerThickness;
}

int ExpandedMudEntries::sourceQuantity(CKvsBase& object, int entry, int) {
  return quantity(object, entry);
}

void ExpandedMudEntries::requestItems(CVdFileSelectorDlg& selector, CKvsBase& object) {
  selector.SetNoItems(fractionCount(object));
}

void ExpandedMudEntries::requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int) {
  requestItems(selector, object);
}

std::vector<std::string> expandedEntryNames(CKvsBase& object) {
  std::vector<std::string> names;
  for (int entry = 1; entry <= ExpandedMudEntries::count(object); ++entry)
    names.push_back(ExpandedMudEntries::name(object, entry));
  return names;
}

}  // namespace gridbay
