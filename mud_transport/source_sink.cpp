#include "mud_transport/source_sink.h"

#include "mud_transport/task_selection.h"

namespace gridbay {

int CNmtSourceSinkObjectKvs::numberOnFile(int entry) const {
  const CNmtTaskSelectionKvs* task = mudTaskOf(const_cast<CNmtSourceSinkObjectKvs&>(*this));
  if (task == nullptr || !task->includeSalinity) return entry;
  return entry == 1 ? static_cast<int>(constants.size()) : entry - 1;
}

}  // namespace gridbay
