// A list of many objects: loaded from a tree that was read, and saved again to a file.

#include <benchmark/benchmark.h>
#include <fmt/format.h>

#include <filesystem>

#include "basic/area_description.h"
#include "core/kdl_reader.h"
#include "core/list_kvs.h"
#include "core/table_code.h"
#include "setup/edit_history.h"

namespace gridbay {
namespace {

class Point final : public TableKvs<Point> {
 public:
  using TableKvs::TableKvs;
  double x = 0;
  double y = 0;
  double z = 0;
  static constexpr auto table() {
    return keywords(keyword("X", &Point::x), keyword("Y", &Point::y), keyword("Z", &Point::z));
  }
};

class Points final : public ListKvs<Points, Point> {
 public:
  using ListKvs::ListKvs;
  static constexpr auto table() {
    return section("POINTS", count("No_Of_Points"), items("POINT_%d", {"There are fewer points than said"}));
  }
};

std::string textOf(int points) {
  std::string text = fmt::format("POINTS {{\n    No_Of_Points {}\n", points);
  for (int i = 1; i <= points; ++i) {
    text += fmt::format("    POINT_{} {{\n        X {:.3f}\n        Y {:.3f}\n        Z {:.6f}\n    }}\n", i,
                        480000 + i * 0.37, 6100000 + i * 0.61, (i % 977) * 0.013 - 5);
  }
  return text + "}\n";
}

void parseAlone(benchmark::State& state) {
  const std::string text = textOf(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    const ReadText read = readKdl(FileText(text));
    double sum = 0;
    for (const Node* point = read.tree->root().first()->first(); point != nullptr; point = point->next()) {
      if (!point->isSection()) continue;
      for (const Node* value = point->first(); value != nullptr; value = value->next())
        sum += kvsGetDouble(&value->values().front());
    }
    benchmark::DoNotOptimize(sum);
  }
}

void loadAndSave(benchmark::State& state) {
  const std::string text = textOf(static_cast<int>(state.range(0)));
  const std::string path = "/dev/shm/gridbay-bench.v27";
  for (auto _ : state) {
    state.PauseTiming();
    ReadText read = readKdl(FileText(text));
    state.ResumeTiming();
    {
      Points points(nullptr);
      points.Load(&read.tree->root(), path);
      if (points.GetCount() != state.range(0)) state.SkipWithError("not all points were loaded");
      KvsFile file;
      points.Save(file, path);
      if (!kvsWrite(file, path)) state.SkipWithError("the file cannot be written");
    }
    state.PauseTiming();
    read.tree.reset();
    state.ResumeTiming();
  }
  std::filesystem::remove(path);
}

// One point of a long list is changed, and what has changed is found and kept for an undo, as after an edit
// on a page: in the list, and in all else that a model has.
void editWithHistory(benchmark::State& state) {
  Points points(nullptr);
  points.SetCount(static_cast<int>(state.range(0)));
  Points twin(nullptr);
  twin.AssignState(points);
  CGlobalKvs model;
  EditHistory history;
  history.start(model, {});
  int number = 0;
  for (auto _ : state) {
    number = number % points.GetCount() + 1;
    points.GetItem(number)->z += 1;
    model.areaDescription->dryingDepth += 0.01F;
    const auto change = points.TakeChange(twin);
    if (change == nullptr || !history.record(model, PageId::floodAndDry, "Drying depth", false, {}))
      state.SkipWithError("the edit was not seen");
    benchmark::DoNotOptimize(change);
  }
}

BENCHMARK(editWithHistory)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK(parseAlone)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond)->MinTime(2);
BENCHMARK(loadAndSave)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond)->MinTime(2);

}  // namespace
}  // namespace gridbay
