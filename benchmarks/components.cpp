// The list of components, which leads all that has an entry for each of them.

#include <benchmark/benchmark.h>
#include <netcdf.h>

#include <filesystem>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/starting_conditions.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "platform/tsb/tsb_writer.h"
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

constexpr std::size_t kSide = 10000;
constexpr int kComponents = 16;

// A hot start file, of which only what is asked for is on the disk: the types of the components.
class HotFile {
 public:
  HotFile() {
    TsbDefinition definition;
    definition.dataType = 2;
    definition.axes = {{kSide, 0, 30, "m"}, {kSide, 0, 30, "m"}};
    for (int number = 1; number <= kComponents; ++number)
      definition.items.push_back({"Component " + std::to_string(number), 100201, "mg l-1"});
    definition.items.push_back({"Types"});
    Result<TsbWriter> writer = TsbWriter::create(path(), definition);
    const std::vector<float> types(kSide * kSide, 1);
    if (!writer || !writer->write(kComponents + 1, 0, std::span<const float>(types)) || !writer->commit())
      std::abort();
  }
  ~HotFile() { std::filesystem::remove(path()); }
  static std::string path() {
    return (std::filesystem::temp_directory_path() / "gridbay-bench-hot.tsb2").string();
  }
};

// The check of the file reads the types, and no more.
void hotFileChecked(benchmark::State& state) {
  const HotFile file;
  CGlobalKvs root;
  CBathymetryObjectKvs& area = *root.bathymetry->GetArea(1);
  area.noJ = area.noK = kSide;
  area.dx = area.dy = 30;
  root.nadStartingConditions->hotStart = true;
  root.nadStartingConditions->at(1).file = file.path();
  for (auto _ : state) {
    ValidationList messages;
    if (root.nadStartingConditions->Validate(messages, 1) != 0 ||
        root.nadComponent->GetCount() != kComponents)
      state.SkipWithError("the file is not valid");
  }
}
BENCHMARK(hotFileChecked)->Unit(benchmark::kMillisecond);

// One step of one item, by the library.
void hotItemReadByLibrary(benchmark::State& state) {
  const HotFile file;
  for (auto _ : state) {
    int id = 0;
    int variable = 0;
    std::vector<float> values(kSide * kSide);
    nc_open(HotFile::path().c_str(), NC_NOWRITE, &id);
    nc_inq_varid(id, "types", &variable);
    if (nc_get_var_float(id, variable, values.data()) != NC_NOERR)
      state.SkipWithError("the item was not read");
    nc_close(id);
  }
}
BENCHMARK(hotItemReadByLibrary)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
