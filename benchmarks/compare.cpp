// Two filled setups compared, and merged, with nothing of the disk in it.

#include <benchmark/benchmark.h>

#include <cstdlib>

#include "compare/setup_difference.h"
#include "compare/tree_merge.h"
#include "structures/dike.h"

namespace gridbay {
namespace {

SetupFile setupOf(const char* name) {
  Result<SetupFile> setup = SetupFile::open(std::string(GRIDBAY_SETUPS "/") + name, nullptr);
  if (!setup) std::abort();
  return std::move(*setup);
}

// The same but for a few values; and, by the argument, dikes of so many points.
void compareNearlyTheSame(benchmark::State& state) {
  SetupFile own = setupOf("salinity.v27");
  CNhdDikeKvs& dikes = *own.model().nhdDike;
  auto& points = dikes.GetItem(1)->points;
  for (std::int64_t i = 0; i < state.range(0); ++i)
    points.push_back({480000.0 + static_cast<double>(i), 6100000, 1});
  const std::string path = GRIDBAY_SETUPS "/a.v27";
  const KvsHandle ownFile = own.tree(path);
  own.model().nhdDike->GetItem(1)->crestLevel += 1;
  const KvsHandle otherFile = own.tree(path);
  for (auto _ : state) benchmark::DoNotOptimize(compareFiles(*ownFile, *otherFile, path).differences.size());
}
BENCHMARK(compareNearlyTheSame)->Unit(benchmark::kMillisecond)->Arg(0)->Arg(10000);

void compareModules(benchmark::State& state) {
  const std::string path = GRIDBAY_SETUPS "/a.v27";
  const KvsHandle own = setupOf("salinity.v27").tree(path);
  const KvsHandle other = setupOf("oxygen.v27").tree(path);
  for (auto _ : state) benchmark::DoNotOptimize(compareFiles(*own, *other, path).differences.size());
}
BENCHMARK(compareModules)->Unit(benchmark::kMillisecond);

void mergeModules(benchmark::State& state) {
  const std::string path = GRIDBAY_SETUPS "/a.v27";
  const KvsHandle base = setupOf("flood.v27").tree(path);
  const KvsHandle own = setupOf("salinity.v27").tree(path);
  const KvsHandle other = setupOf("oxygen.v27").tree(path);
  for (auto _ : state) {
    const MergedTree merged =
        mergeTrees(*base, *own, *other, [](const MergeConflict&) { return MergeSide::own; });
    benchmark::DoNotOptimize(merged.conflicts.size());
  }
}
BENCHMARK(mergeModules)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
