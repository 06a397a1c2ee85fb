// A look at a setup for advice, with all that it needs of data files known.

#include <benchmark/benchmark.h>
#include <fmt/format.h>

#include <filesystem>
#include <string>
#include <vector>

#include "advection_dispersion/component.h"
#include "advice/advisor.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "mud_transport_expanded/task_selection.h"
#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_writer.h"
#include "setup/global_kvs.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

constexpr double kEasting = 480000;
constexpr double kNorthing = 6100000;

// The grid of area n, of so many points in each direction, in a zone of a projection.
std::string writeGrid(std::size_t side, int number = 1, double spacing = 30, double off = 0) {
  TsbDefinition grid;
  grid.time.type = TsbTimeAxisType::relativeEquidistant;
  grid.axes = {{side, kEasting + off, spacing, "m"}, {side, kNorthing + off, spacing, "m"}};
  grid.items = {{"Bathymetry", 100079, "m"}};
  grid.customBlocks = {{"V27_Misc", {0, 0, 0, 10}}};
  grid.geography = TsbGeography{"UTM-32"};
  CVdMapProjection("UTM-32").Proj2Geo(kEasting + off, kNorthing + off, &grid.geography->longitude,
                                      &grid.geography->latitude);
  std::vector<float> values(side * side);
  for (std::size_t i = 0; i < values.size(); ++i) values[i] = -5 - static_cast<float>(i % 1013) / 100;
  const std::string path =
      (std::filesystem::temp_directory_path() / fmt::format("gridbay-bench-advice{}.tsb2", number)).string();
  Result<TsbWriter> writer = TsbWriter::create(path, grid);
  if (!writer || !writer->write(1, 0, std::span<const float>(values)) || !writer->commit()) std::abort();
  return path;
}

// A discharge (m3/s) and velocity (m/s) every ten minutes from a moment.
std::string writeDischarge(const DateTime& start) {
  constexpr std::size_t kSteps = 1000;
  TsbDefinition series;
  series.time.start = *start.parts();
  series.time.unit = "min";
  series.time.step = 10;
  series.time.count = kSteps;
  series.items = {{"Discharge", 100012, "m^3/s"}, {"Velocity", 100010, "m/s"}};
  const std::string path = (std::filesystem::temp_directory_path() / "gridbay-bench-advice.tsb0").string();
  const std::vector<float> values(kSteps, 1);
  Result<TsbWriter> writer = TsbWriter::create(path, series);
  if (!writer || !writer->write(1, 0, std::span<const float>(values)) ||
      !writer->write(2, 0, std::span<const float>(values)) || !writer->commit())
    std::abort();
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

// A setup with much of everything: areas in each other, sources of which some lie in a boundary, structures,
// outputs, and in all modules that many components or fractions.
void lookAtAHugeSetup(benchmark::State& state) {
  constexpr std::size_t kSide = 1000;
  constexpr int kAreas = 9;
  constexpr int kStructures = 1000;
  constexpr int kDikePoints = 1'000'000;
  constexpr int kOutputs = 18;
  CGlobalKvs model;
  model.bathymetry->projection = "UTM-32";
  model.bathymetry->SetNoAreas(kAreas);
  std::vector<std::string> files;
  double spacing = 30;
  double off = 0;
  constexpr int kOrigin = 3;
  for (int number = 1; number <= kAreas; ++number) {
    files.push_back(writeGrid(kSide, number, spacing, off));
    off += kOrigin * spacing;
    spacing /= 3;
    model.bathymetry->GetArea(number)->fileName = files.back();
    model.bathymetry->GetArea(number)->origin = {kOrigin, kOrigin};
  }
  model.simulationPeriod->timeStepInterval = 0.001F;
  model.moduleSelection->simulationType = module::kAdvectionDispersion;
  const auto classes = static_cast<int>(state.range(1));
  model.nadComponent->SetCount(classes);
  model.nmtExpTaskSelection->SetCounts(1, classes, false);
  model.boundary->defaultPosition = 0;
  model.boundary->SetNoBoundaries(1);
  model.boundary->GetItem(1)->Set(0, 0, 0, kSide - 1);
  const auto sources = static_cast<int>(state.range(0));
  model.sourceSink->SetNoSources(sources);
  files.push_back(writeDischarge(model.simulationPeriod->start));
  for (int number = 1; number <= sources; ++number) {
    model.sourceSink->GetItem(number)->source = {number % 20 == 0 ? 0 : 900, number % 900 + 1};
    model.nhdSourceSink->GetItem(number)->dataFormat = CNhdSourceSinkObjectKvs::kFromFile;
    model.nhdSourceSink->GetItem(number)->dataFile.fileName = files.back();
  }
  model.nhdWeir->SetCount(kStructures);
  for (int number = 1; number <= kStructures; ++number) {
    CNhdWeirObjectKvs& weir = *model.nhdWeir->GetItem(number);
    weir.coordinateType = "UTM-32";
    weir.x = {kEasting + number, kEasting + number + 50};
    weir.y = {kNorthing + 100, kNorthing + 120};
  }
  model.nhdDike->SetCount(1);
  for (int i = 0; i < kDikePoints; ++i)
    model.nhdDike->GetItem(1)->points.push_back({kEasting + i / 100.0, kNorthing + 50, 1});
  model.nhdResult->outputs.SetCount(kOutputs);
  for (int number = 1; number <= kOutputs; ++number)
    model.nhdResult->outputs.GetItem(number)->steps.interval = 100;
  Advisor advisor;
  const std::string setup = (std::filesystem::temp_directory_path() / "bench.v27").string();
  const std::vector<Advice> found = advisor.lookThoroughly(model, setup);
  for (auto _ : state) benchmark::DoNotOptimize(advisor.look(model, setup));
  state.counters["advice"] = static_cast<double>(found.size());
  for (const std::string& file : files) std::filesystem::remove(file);
}
BENCHMARK(lookAtAHugeSetup)
    ->Unit(benchmark::kMillisecond)
    ->Args({100, 1})
    ->Args({2000, 1})
    ->Args({100, 200})
    ->Args({2000, 200});

}  // namespace
}  // namespace gridbay
