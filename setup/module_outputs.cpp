#include <array>

#include "advection_dispersion/result.h"
#include "basic/module_selection.h"
#include "ecology/results.h"
#include "mud_transport/result.h"
#include "mud_transport_expanded/result.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

// What a module writes of its own, by the code under which it runs.
struct OutputRow {
  std::int32_t code;
  ModuleOutput (*output)(CGlobalKvs& root);
};

template <auto results>
ModuleOutput outputOf(CGlobalKvs& root) {
  return {(root.*results)->OutputSizeMB(), (root.*results)->hotStartItems()};
}

constexpr std::array kOutputs{
    OutputRow{module::kAdvectionDispersion, outputOf<&CGlobalKvs::nadResult>},
    OutputRow{module::kMudTransport, outputOf<&CGlobalKvs::nmtResult>},
    OutputRow{module::kMudTransportExpanded, outputOf<&CGlobalKvs::nmtExpResult>},
    OutputRow{module::kEcological, outputOf<&CGlobalKvs::wqsResults>},
};

}  // namespace

ModuleOutput CGlobalKvs::OutputOfModule() {
  for (const OutputRow& row : kOutputs) {
    if (row.code == moduleSelection->simulationType) return row.output(*this);
  }
  return {};
}

}  // namespace gridbay
