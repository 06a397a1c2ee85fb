#include "mud_transport/source_sink.h"

#include "mud_transport/task_selection.h"

namespace gridbay {

bool CNmtSourceSinkObjectKvs::isHeadLastOnFile() const {
  const CNmtTaskSelectionKvs* task = mudTaskOf(const_cast<CNmtSourceSinkObjectKvs&>(*this));
  return task != nullptr && task->includeSalinity;
}

}  // namespace gridbay
