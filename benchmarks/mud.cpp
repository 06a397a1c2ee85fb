// Mud transport: its counts, which lead all lists of both modules, and a full setup of the expanded one.

#include <benchmark/benchmark.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "core/kdl_reader.h"
#include "mud_transport/erosion_for_each_layer.h"
#include "mud_transport/task_selection.h"
#include "mud_transport_expanded/bed_density.h"
#include "mud_transport_expanded/critical_shear_stress.h"
#include "mud_transport_expanded/erosion_coefficient.h"
#include "mud_transport_expanded/task_selection.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

constexpr int kAreas = 9;
constexpr int kFractions = 8;
constexpr int kLayers = 12;
constexpr const char* kPath = "/case/bench.v27";

// From the task of layers to that of fractions and back, in a model with 9 areas.
void changeTask(benchmark::State& state) {
  CGlobalKvs root;
  root.bathymetry->SetNoAreas(kAreas);
  for (auto _ : state) {
    root.nmtTaskSelection->SetLayers(kLayers);
    if (root.nmtErosionForEachLayerDensity->GetCount() != kLayers)
      state.SkipWithError("the layers do not follow");
    root.nmtTaskSelection->SetFractions(kFractions);
  }
}
BENCHMARK(changeTask)->Unit(benchmark::kMillisecond);

void fill(CGlobalKvs& root, int layers) {
  root.moduleSelection->simulationType = module::kMudTransportExpanded;
  root.bathymetry->SetNoAreas(kAreas);
  root.boundary->SetNoBoundaries(14);
  root.sourceSink->SetNoSources(50);
  root.nmtExpTaskSelection->SetCounts(layers, kFractions, true);
  const auto mapAll = [](auto& list) {
    for (int layer = 1; layer <= list.GetCount(); ++layer) {
      for (int area = 1; area <= list.at(layer).GetCount(); ++area) {
        list.at(layer).at(area).format = 1;
        list.at(layer).at(area).file.fileName = "/case/bed.tsb2";
      }
    }
  };
  mapAll(*root.nmtExpBedDensity);
  mapAll(*root.nmtExpCriticalShearStress);
  mapAll(*root.nmtExpErosionCoefficient);
}

std::string textOf(int layers) {
  CGlobalKvs root;
  fill(root, layers);
  KvsFile file;
  root.Save(file, kPath);
  return *file.text();
}

// A full setup with so many layers, from the tree of its text.
void loadExpanded(benchmark::State& state) {
  const std::string text = textOf(static_cast<int>(state.range(0)));
  const ReadText read = readKdl(FileText(std::string_view(text)));
  for (auto _ : state) {
    CGlobalKvs root;
    root.Load(&read.tree->root(), kPath);
    if (root.nmtExpBedDensity->GetCount() != state.range(0))
      state.SkipWithError("not all layers were loaded");
  }
}
BENCHMARK(loadExpanded)->Arg(3)->Arg(6)->Arg(12)->Unit(benchmark::kMillisecond);

void saveExpanded(benchmark::State& state) {
  CGlobalKvs root;
  fill(root, static_cast<int>(state.range(0)));
  for (auto _ : state) {
    KvsFile file;
    root.Save(file, kPath);
    benchmark::DoNotOptimize(file.text());
  }
}
BENCHMARK(saveExpanded)->Arg(3)->Arg(6)->Arg(12)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
