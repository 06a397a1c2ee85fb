// A look at a setup for advice, with all that it needs of data files known.

#include <benchmark/benchmark.h>

#include <filesystem>
#include <vector>

#include "advice/advisor.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_writer.h"
#include "setup/global_kvs.h"
#include "structures/dike.h"

namespace gridbay {
namespace {

constexpr double kEasting = 480000;
constexpr double kNorthing = 6100000;

// A grid of so many points in each direction, in a zone of a projection.
std::string writeGrid(std::size_t side) {
  TsbDefinition grid;
  grid.time.type = TsbTimeAxisType::relativeEquidistant;
  grid.axes = {{side, kEasting, 30, "m"}, {side, kNorthing, 30, "m"}};
  grid.items = {{"Bathymetry", 100079, "m"}};
  grid.customBlocks = {{"V27_Misc", {0, 0, 0, 10}}};
  grid.geography = TsbGeography{"UTM-32"};
  CVdMapProjection("UTM-32").Proj2Geo(kEasting, kNorthing, &grid.geography->longitude,
                                      &grid.geography->latitude);
  std::vector<float> values(side * side);
  for (std::size_t i = 0; i < values.size(); ++i) values[i] = -5 - static_cast<float>(i % 1013) / 100;
  const std::string path = (std::filesystem::temp_directory_path() / "gridbay-bench-advice.tsb2").string();
  Result<TsbWriter> writer = TsbWriter::create(path, grid);
  if (!writer || !writer->write(1, 0, std::span<const float>(values)) || !writer->commit()) std::abort();
  return path;
}

// By the points of the grid in each direction and those of a dike.
void lookForAdvice(benchmark::State& state) {
  const std::string path = writeGrid(static_cast<std::size_t>(state.range(0)));
  CGlobalKvs model;
  model.bathymetry->GetArea(1)->fileName = path;
  model.bathymetry->projection = "UTM-32";
  model.nhdDike->SetCount(1);
  for (std::int64_t i = 0; i < state.range(1); ++i)
    model.nhdDike->GetItem(1)->points.push_back({kEasting + static_cast<double>(i) / 100, kNorthing + 50, 1});
  Advisor advisor;
  const std::string setup = (std::filesystem::temp_directory_path() / "bench.v27").string();
  advisor.lookThoroughly(model, setup);
  for (auto _ : state) benchmark::DoNotOptimize(advisor.look(model, setup));
  std::filesystem::remove(path);
}
BENCHMARK(lookForAdvice)
    ->Unit(benchmark::kMillisecond)
    ->Args({121, 4})
    ->Args({121, 100000})
    ->Args({10000, 4});

}  // namespace
}  // namespace gridbay
