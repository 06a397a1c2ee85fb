// The list of components, which leads all that has an entry for each of them.

#include <benchmark/benchmark.h>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

// From 1 component to 16 and back, in a model with 9 areas, 300 boundaries and 1,000 sources.
void growComponents(benchmark::State& state) {
  CGlobalKvs root;
  root.bathymetry->SetNoAreas(9);
  root.boundary->SetNoBoundaries(300);
  root.sourceSink->SetNoSources(1000);
  for (auto _ : state) {
    root.nadComponent->SetCount(16);
    if (root.nadBoundary->GetItem(300)->constants.size() != 16)
      state.SkipWithError("the boundaries do not follow");
    root.nadComponent->SetCount(1);
  }
}
BENCHMARK(growComponents)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
