#include "mud_transport/transported.h"

#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/task_selection.h"
#include "platform/units/units.h"

namespace gridbay {

CNmtTaskSelectionKvs* mudTaskOf(CKvsBase& object) {
  auto* module = object.parts<MudTransportParts>();
  return module == nullptr ? nullptr : module->nmtTaskSelection.get();
}

int MudFractions::count(CKvsBase& object) {
  const CNmtTaskSelectionKvs* task = mudTaskOf(object);
  return task == nullptr ? 0 : task->TransportedCount();
}

std::string MudFractions::name(CKvsBase& object, int entry) {
  const CNmtTaskSelectionKvs* task = mudTaskOf(object);
  return task == nullptr ? std::string() : task->EntryName(entry);
}

int MudFractions::quantity(CKvsBase& object, int entry) {
  const CNmtTaskSelectionKvs* task = mudTaskOf(object);
  return task == nullptr ? item::kConcentration : task->EntryQuantity(entry);
}

int MudFractions::sourceQuantity(CKvsBase& object, int entry, int) {
  return quantity(object, entry);
}

void MudFractions::requestItems(CVdFileSelectorDlg& selector, CKvsBase& object) {
  const CNmtTaskSelectionKvs* task = mudTaskOf(object);
  selector.SetNoItems(task == nullptr ? 0 : task->fractions);
}

void MudFractions::requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int) {
  requestItems(selector, object);
}

std::vector<std::string> mudFractionNames(CKvsBase& object) {
  std::vector<std::string> names;
  for (int entry = 1; entry <= MudFractions::count(object); ++entry)
    names.push_back(MudFractions::name(object, entry));
  return names;
}

}  // namespace gridbay
