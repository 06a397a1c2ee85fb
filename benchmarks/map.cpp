// The map of a model with nine areas, the outermost of 10,000 x 10,000 points, 1,000 dikes, 1,000 weirs and
// 1,000 sources: made first, and again as after an edit.

#include <benchmark/benchmark.h>

#include <filesystem>

#include "basic/bathymetry.h"
#include "basic/source_sink.h"
#include "map/setup_map.h"
#include "platform/tsb/tsb_writer.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

constexpr int kStructures = LineStructure::kMost;
constexpr int kPoints = 50;  // of each polyline
const std::filesystem::path kFolder = "/dev/shm/gridbay-bench-map";

std::string gridFile(int number, std::size_t points, double spacing) {
  const std::string path = (kFolder / ("a" + std::to_string(number) + ".tsb2")).string();
  TsbDefinition definition;
  definition.time.type = TsbTimeAxisType::relativeEquidistant;
  definition.axes = {{points, 0, spacing, "m"}, {points, 0, spacing, "m"}};
  definition.items = {{"Bathymetry", 100079, "m"}};
  definition.customBlocks = {{"V27_Misc", {0, 0, 0, 10}}};
  definition.geography = TsbGeography{"UTM-32", 9, 54};
  Result<TsbWriter> writer = TsbWriter::create(path, definition);
  const std::vector<float> row(points, -5);
  for (std::size_t k = 0; k < points; ++k) (void)writer->writeRows(1, 0, k, row);
  (void)writer->commit();
  return path;
}

void fill(CGlobalKvs& model) {
  std::filesystem::create_directories(kFolder);
  model.bathymetry->SetNoAreas(CBathymetryKvs::kMostAreas);
  for (int number = 1; number <= CBathymetryKvs::kMostAreas; ++number) {
    CBathymetryObjectKvs& area = model.bathymetry->at(number);
    area.fileName = number == 1 ? gridFile(1, 10000, 30) : gridFile(number, 301, 10);
    area.enclosingArea = 1;
    area.origin = {number * 1000, 500};
  }
  model.sourceSink->SetNoSources(kStructures);
  model.nhdWeir->SetCount(kStructures);
  model.nhdDike->SetCount(kStructures);
  for (int number = 1; number <= kStructures; ++number) {
    model.sourceSink->at(number).source = {number, number};
    CNhdWeirObjectKvs& weir = model.nhdWeir->at(number);
    weir.coordinateType = "UTM-33";
    CNhdDikeObjectKvs& dike = model.nhdDike->at(number);
    dike.coordinateType = "EPSG:4326";
    for (int i = 0; i < kPoints; ++i) {
      weir.x.push_back(120000 + i);
      weir.y.push_back(6000000 + number);
      dike.points.push_back({9.1 + i * 1e-4, 54.1 + number * 1e-4, 3});
    }
  }
}

void firstScene(benchmark::State& state) {
  CGlobalKvs model;
  fill(model);
  for (auto _ : state) {
    SetupMap map;
    benchmark::DoNotOptimize(map.scene(model).features.data());
  }
  std::filesystem::remove_all(kFolder);
}
BENCHMARK(firstScene)->Name("map/first")->Unit(benchmark::kMillisecond);

void sceneAgain(benchmark::State& state) {
  CGlobalKvs model;
  fill(model);
  SetupMap map;
  map.scene(model);
  double east = 0;
  for (auto _ : state) {
    model.nhdWeir->at(7).x[3] = 120000 + (east += 1);
    benchmark::DoNotOptimize(map.scene(model).features.data());
  }
  std::filesystem::remove_all(kFolder);
}
BENCHMARK(sceneAgain)->Name("map/after an edit")->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
