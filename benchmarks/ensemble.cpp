// The members of an ensemble of the shipped example, made and checked on all cores, beside plain copies of
// its file and beside one member's making and checking by itself.

#include "batch/ensemble.h"

#include <benchmark/benchmark.h>
#include <fmt/format.h>

#include <filesystem>
#include <fstream>

#include "basic/area_description.h"

namespace gridbay {
namespace {

namespace fs = std::filesystem;

// Made by scripts/demo.
const std::string kBase = GRIDBAY_EXAMPLE "/estuary.v27";

class NewFolder {
 public:
  NewFolder() : path_(fs::temp_directory_path() / "gridbay-bench-ensemble") { fs::remove_all(path_); }
  NewFolder(const NewFolder&) = delete;
  NewFolder& operator=(const NewFolder&) = delete;
  ~NewFolder() { fs::remove_all(path_); }
  std::string file(const std::string& name) const { return (path_ / name).string(); }
  void make() const { fs::create_directories(path_); }

 private:
  fs::path path_;
};

void setRate(benchmark::State& state) {
  state.counters["members"] =
      benchmark::Counter(static_cast<double>(state.range(0) * static_cast<std::int64_t>(state.iterations())),
                         benchmark::Counter::kIsRate);
}

void makeMembers(benchmark::State& state) {
  if (!fs::exists(kBase)) return state.SkipWithError("scripts/demo makes the example");
  for (auto _ : state) {
    state.PauseTiming();
    const NewFolder folder;
    folder.make();
    const std::string table = folder.file("table.csv");
    {
      std::ofstream text(table);
      text << "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth,HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_1/"
              "crest_level,"
              "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/SOURCE_SINK_1/Constant_Magnitude\n";
      for (int i = 0; i < state.range(0); ++i)
        text << fmt::format("{:.3f},{:.2f},{}\n", 0.05 + i % 40 * 0.001, 2 + i % 300 * 0.01, 1 + i % 17);
    }
    state.ResumeTiming();
    CollectingMessageHost host;
    const Result<EnsembleTable> read = readEnsembleTable(table, "estuary");
    const Result<EnsembleResult> made = makeEnsemble({*read, kBase, folder.file("out")}, host, {});
    state.PauseTiming();
    if (!made || made->members.size() != static_cast<std::size_t>(state.range(0)) ||
        !std::ranges::all_of(made->members, [](const MemberReport& member) { return member.isClean(); }))
      state.SkipWithError(made ? "a member has faults" : made.error().c_str());
    state.ResumeTiming();
  }
  setRate(state);
}
BENCHMARK(makeMembers)->Arg(10'000)->Unit(benchmark::kMillisecond)->UseRealTime()->Iterations(1);

void copyMembers(benchmark::State& state) {
  if (!fs::exists(kBase)) return state.SkipWithError("scripts/demo makes the example");
  for (auto _ : state) {
    const NewFolder folder;
    folder.make();
    for (int i = 0; i < state.range(0); ++i) fs::copy_file(kBase, folder.file(std::to_string(i)));
  }
  setRate(state);
}
BENCHMARK(copyMembers)->Arg(10'000)->Unit(benchmark::kMillisecond)->UseRealTime()->Iterations(1);

// What each member would cost with nothing shared: loaded, set, saved and checked from its file.
void openSetSaveCheck(benchmark::State& state) {
  if (!fs::exists(kBase)) return state.SkipWithError("scripts/demo makes the example");
  const NewFolder folder;
  folder.make();
  for (auto _ : state) {
    Result<SetupFile> setup = SetupFile::open(kBase, nullptr);
    setup->model().areaDescription->dryingDepth = 0.1F;
    const std::string file = folder.file("member.v27");
    if (!setup->save(file)) state.SkipWithError("the member cannot be saved");
    Result<SetupFile> again = SetupFile::open(file, nullptr);
    ValidationList messages;
    benchmark::DoNotOptimize(again->model().Validate(messages, 1));
  }
}
BENCHMARK(openSetSaveCheck)->Unit(benchmark::kMillisecond)->MinTime(1);

}  // namespace
}  // namespace gridbay
