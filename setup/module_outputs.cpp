#include <array>

#include "basic/module_selection.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

// What a module writes of its own, by the code under which it runs.
struct OutputRow {
  std::int32_t code;
  ModuleOutput (*output)(CGlobalKvs& root);
};

constexpr std::array<OutputRow, 0> kOutputs{};

}  // namespace

ModuleOutput CGlobalKvs::OutputOfModule() {
  for (const OutputRow& row : kOutputs) {
    if (row.code == moduleSelection->simulationType) return row.output(*this);
  }
  return {};
}

}  // namespace gridbay
