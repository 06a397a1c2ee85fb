// Reading and writing a large grid, each beside the data file library's own call on one buffer.

#include <benchmark/benchmark.h>
#include <netcdf.h>

#include <cmath>
#include <filesystem>
#include <vector>

#include "basic/bathymetry.h"
#include "basic/boundary_detection.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

constexpr std::size_t kSide = 10000;

TsbDefinition definition() {
  TsbDefinition grid;
  grid.time.type = TsbTimeAxisType::relativeEquidistant;
  grid.axes = {{kSide, 0, 30, "m"}, {kSide, 0, 30, "m"}};
  grid.items = {{"Bathymetry", 100079, "m"}};
  grid.customBlocks = {{"V27_Misc", {0, 0, 0, 10}}};
  return grid;
}

// One buffer of values and one file for all benchmarks of a run.
struct LargeGrid {
  LargeGrid()
      : values(kSide * kSide),
        path((std::filesystem::temp_directory_path() / "gridbay-bench.tsb2").string()) {
    for (std::size_t i = 0; i < values.size(); ++i) values[i] = -5 - static_cast<float>(i % 1013) / 100;
    write();
  }
  ~LargeGrid() { std::filesystem::remove(path); }
  void write() const {
    Result<TsbWriter> writer = TsbWriter::create(path, definition());
    if (!writer || !writer->write(1, 0, std::span<const float>(values)) || !writer->commit()) std::abort();
  }
  std::vector<float> values;
  std::string path;
};

LargeGrid& largeGrid() {
  static LargeGrid grid;
  return grid;
}

void setBytes(benchmark::State& state) {
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(kSide * kSide * sizeof(float)));
}

// Fresh memory for each read, as a model takes it.
void readByLibrary(benchmark::State& state) {
  const std::string path = largeGrid().path;
  for (auto _ : state) {
    int file = 0;
    int variable = 0;
    const auto buffer = std::make_unique_for_overwrite<float[]>(kSide * kSide);
    nc_open(path.c_str(), NC_NOWRITE, &file);
    nc_inq_varid(file, "bathymetry", &variable);
    nc_get_var_float(file, variable, buffer.get());
    nc_close(file);
    benchmark::DoNotOptimize(buffer.get());
  }
  setBytes(state);
}
BENCHMARK(readByLibrary)->Unit(benchmark::kMillisecond)->MinWarmUpTime(1)->MinTime(2);

void readGrid(benchmark::State& state) {
  const std::string path = largeGrid().path;
  for (auto _ : state) {
    CGlobalKvs root;
    CBathymetryObjectKvs& area = *root.bathymetry->GetArea(1);
    area.fileName = path;
    ValidationList messages;
    if (area.ReadGrid(messages, 1) != 0) state.SkipWithError("the grid is not valid");
  }
  setBytes(state);
}
BENCHMARK(readGrid)->Unit(benchmark::kMillisecond)->MinWarmUpTime(1)->MinTime(2);

void writeByLibrary(benchmark::State& state) {
  const std::string path = largeGrid().path + ".peer";
  const std::vector<float>& values = largeGrid().values;
  for (auto _ : state) {
    int file = 0;
    int variable = 0;
    int dimensions[2];
    nc_create(path.c_str(), NC_NETCDF4 | NC_CLOBBER, &file);
    nc_def_dim(file, "y", kSide, &dimensions[0]);
    nc_def_dim(file, "x", kSide, &dimensions[1]);
    nc_def_var(file, "bathymetry", NC_FLOAT, 2, dimensions, &variable);
    nc_def_var_fill(file, variable, NC_NOFILL, nullptr);
    nc_put_var_float(file, variable, values.data());
    nc_close(file);
  }
  std::filesystem::remove(path);
  setBytes(state);
}
BENCHMARK(writeByLibrary)->Unit(benchmark::kMillisecond)->MinTime(2);

// With the flush to the disk that a safe write has and the peer does not.
void writeGrid(benchmark::State& state) {
  for (auto _ : state) largeGrid().write();
  setBytes(state);
}
BENCHMARK(writeGrid)->Unit(benchmark::kMillisecond)->MinTime(2);

CBathymetryObjectKvs& readArea(CGlobalKvs& root) {
  CBathymetryObjectKvs& area = *root.bathymetry->GetArea(1);
  area.fileName = largeGrid().path;
  ValidationList messages;
  area.ReadGrid(messages, 1);
  return area;
}

void plainSweep(benchmark::State& state) {
  CGlobalKvs root;
  const CBathymetryObjectKvs& area = readArea(root);
  for (auto _ : state) {
    float deepest = 0;
    for (const float value : area.grid.values()) deepest = value < deepest ? value : deepest;
    benchmark::DoNotOptimize(deepest);
  }
  setBytes(state);
}
BENCHMARK(plainSweep)->Unit(benchmark::kMillisecond);

// Only the border is looked at: the time is that of 40,000 points, not of 100,000,000.
void detectBoundaries(benchmark::State& state) {
  CGlobalKvs root;
  const CBathymetryObjectKvs& area = readArea(root);
  for (auto _ : state) benchmark::DoNotOptimize(findOpenBoundaries(area.grid, area.landValue));
}
BENCHMARK(detectBoundaries)->Unit(benchmark::kMillisecond);

void courantWithEightNestedAreas(benchmark::State& state) {
  CGlobalKvs root;
  readArea(root);
  root.bathymetry->SetNoAreas(9);
  for (int n = 2; n <= 9; ++n) {
    CBathymetryObjectKvs& nested = *root.bathymetry->GetArea(n);
    nested.enclosingArea = 1;
    nested.origin = {n * 1000, n * 1000};
    nested.noJ = 301;
    nested.noK = 301;
  }
  for (auto _ : state) {
    double courant = 0;
    int area = 0;
    root.bathymetry->GetMaxCourant(1, &courant, &area);
    benchmark::DoNotOptimize(courant);
  }
  setBytes(state);
}
BENCHMARK(courantWithEightNestedAreas)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
