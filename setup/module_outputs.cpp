#include <array>

#include "advection_dispersion/result.h"
#include "basic/module_selection.h"
#include "ecology/results.h"
#include "mud_transport/result.h"
#include "mud_transport/task_selection.h"
#include "mud_transport_expanded/result.h"
#include "mud_transport_expanded/task_selection.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

// What a module writes of its own, by the code under which it runs. The hot start files of expanded mud and
// of ecology don't count in the total.
struct OutputRow {
  std::int32_t code;
  ModuleOutput (*output)(CGlobalKvs& root);
};

ModuleOutput ofDissolved(CGlobalKvs& root) {
  return {root.nadResult->OutputSizeMB(), root.nadResult->hotStartItems()};
}

// The task of fractions has three items of the bed beside those that are transported.
ModuleOutput ofMud(CGlobalKvs& root) {
  constexpr int kItemsOfBed = 3;
  const int items = root.nmtResult->hotStartItems();
  return {root.nmtResult->OutputSizeMB(),
          items > 0 && root.nmtTaskSelection->multiFraction ? items + kItemsOfBed : items};
}

// What is bound to the mud is written as much again.
ModuleOutput ofExpandedMud(CGlobalKvs& root) {
  const double size = root.nmtExpResult->OutputSizeMB();
  return {root.nmtExpTaskSelection->includeXenobiotics ? 2 * size : size, 0};
}

ModuleOutput ofEcology(CGlobalKvs& root) {
  return {root.wqsResults->OutputSizeMB(), 0};
}

constexpr std::array kOutputs{
    OutputRow{module::kAdvectionDispersion, ofDissolved},
    OutputRow{module::kMudTransport, ofMud},
    OutputRow{module::kMudTransportExpanded, ofExpandedMud},
    OutputRow{module::kEcological, ofEcology},
};

}  // namespace

ModuleOutput CGlobalKvs::OutputOfModule() {
  for (const OutputRow& row : kOutputs) {
    if (row.code == moduleSelection->simulationType) return row.output(*this);
  }
  return {};
}

}  // namespace gridbay
