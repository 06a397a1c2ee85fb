// Dikes with very many points: loaded, saved, imported, edited with the edit kept for an undo, checked, and
// the cells of their page asked for as a scroll does; beside plain ways through the same numbers.

#include <benchmark/benchmark.h>
#include <fmt/format.h>

#include <charconv>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <string>

#include "core/kdl_reader.h"
#include "pages/grid_wnd.h"
#include "pages/no_host.h"
#include "setup/page_factory.h"
#include "setup/setup_doc.h"
#include "structures/dike.h"
#include "structures/xyz_import.h"

namespace gridbay {
namespace {

constexpr int kDikes = 1000;
constexpr int kPoints = 1000;  // of each dike
constexpr int kLines = 1'000'000;
const std::string kSetup = "/dev/shm/gridbay-bench.v27";
const std::string kXyz = "/dev/shm/gridbay-bench.xyz";

DikePoint pointAt(int i) {
  return {480000 + i * 0.37, 6100000 + i * 0.61, (i % 977) * 0.013 - 5};
}

void fill(CNhdDikeKvs& dikes, int count, int points) {
  dikes.SetCount(count);
  for (int number = 1; number <= count; ++number) {
    for (int i = 0; i < points; ++i) dikes.at(number).points.push_back(pointAt(number * points + i));
  }
}

const std::string& setupText() {
  static const std::string made = [] {
    CNhdDikeKvs dikes(nullptr);
    fill(dikes, kDikes, kPoints);
    KvsFile file;
    dikes.Save(file, kSetup);
    return *file.text();
  }();
  return made;
}

void setBytes(benchmark::State& state, std::size_t bytes) {
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(bytes));
}

void dikesParsed(benchmark::State& state) {
  const std::string& text = setupText();
  for (auto _ : state) {
    const ReadText read = readKdl(FileText(text));
    double sum = 0;
    for (const Node* dike = read.tree->root().first()->first(); dike != nullptr; dike = dike->next()) {
      if (!dike->isSection()) continue;
      for (const Node* point = dike->first(); point != nullptr; point = point->next()) {
        if (!point->isSection() || !point->name().starts_with("POINT")) continue;
        for (const Node* value = point->first(); value != nullptr; value = value->next())
          sum += kvsGetDouble(&value->values().front());
      }
    }
    benchmark::DoNotOptimize(sum);
  }
  setBytes(state, text.size());
}
BENCHMARK(dikesParsed)->Unit(benchmark::kMillisecond)->MinTime(2);

void dikesParsedAndLoaded(benchmark::State& state) {
  const std::string& text = setupText();
  for (auto _ : state) {
    const ReadText read = readKdl(FileText(text));
    CNhdDikeKvs dikes(nullptr);
    dikes.Load(&read.tree->root(), kSetup);
    if (dikes.GetCount() != kDikes || dikes.at(kDikes).points.size() != std::size_t{kPoints})
      state.SkipWithError("not all points were loaded");
  }
  setBytes(state, text.size());
}
BENCHMARK(dikesParsedAndLoaded)->Unit(benchmark::kMillisecond)->MinTime(2);

void dikesSaved(benchmark::State& state) {
  CNhdDikeKvs dikes(nullptr);
  fill(dikes, kDikes, kPoints);
  for (auto _ : state) {
    KvsFile file;
    dikes.Save(file, kSetup);
    if (!kvsWrite(file, kSetup)) state.SkipWithError("the file cannot be written");
  }
  std::filesystem::remove(kSetup);
  setBytes(state, setupText().size());
}
BENCHMARK(dikesSaved)->Unit(benchmark::kMillisecond)->MinTime(2);

// The same numbers, each with a line feed behind it.
void dikesWrittenPlainly(benchmark::State& state) {
  CNhdDikeKvs dikes(nullptr);
  fill(dikes, kDikes, kPoints);
  constexpr std::size_t kPiece = 1 << 16;
  constexpr std::size_t kLongest = 32;
  const auto piece = std::make_unique_for_overwrite<char[]>(kPiece);
  for (auto _ : state) {
    std::FILE* file = std::fopen(kSetup.c_str(), "wb");
    char* at = piece.get();
    for (int number = 1; number <= kDikes; ++number) {
      const SharedArray<DikePoint>& points = dikes.at(number).points;
      for (std::size_t i = 0; i < points.size(); ++i) {
        for (const double value : {points[i].x, points[i].y, points[i].z}) {
          at = std::to_chars(at, piece.get() + kPiece, value).ptr;
          *at++ = '\n';
        }
        if (at + 3 * kLongest < piece.get() + kPiece) continue;
        std::fwrite(piece.get(), 1, static_cast<std::size_t>(at - piece.get()), file);
        at = piece.get();
      }
    }
    std::fwrite(piece.get(), 1, static_cast<std::size_t>(at - piece.get()), file);
    std::fclose(file);
  }
  std::filesystem::remove(kSetup);
}
BENCHMARK(dikesWrittenPlainly)->Unit(benchmark::kMillisecond)->MinTime(2);

// What a save asks first: which sections of the file it would leave out.
void dikesSearchedForUnknown(benchmark::State& state) {
  std::ofstream(kSetup) << "VANE27_NESTED_MODEL {\nHYDRODYNAMIC_MODULE {\nSTRUCTURES {\n"
                        << setupText() << "}\n}\n}\n";
  Result<SetupFile> setup = SetupFile::open(kSetup, nullptr);
  for (auto _ : state) {
    if (!setup->unknownSections().empty()) state.SkipWithError("sections are unknown");
  }
  std::filesystem::remove(kSetup);
}
BENCHMARK(dikesSearchedForUnknown)->Unit(benchmark::kMillisecond);

const std::string& xyzText() {
  static const std::string made = [] {
    std::string text;
    for (int i = 0; i < kLines; ++i) {
      const DikePoint point = pointAt(i);
      text += fmt::format("{:.3f} {:.3f} {:.3f}\n", point.x, point.y, point.z);
    }
    return text;
  }();
  return made;
}

void xyzImported(benchmark::State& state) {
  const std::string& text = xyzText();
  std::ofstream(kXyz) << text;
  for (auto _ : state) {
    SharedArray<DikePoint> points;
    if (importXyz(kXyz, {}, points) != XyzOutcome::success || points.size() != std::size_t{kLines})
      state.SkipWithError("not all points were imported");
  }
  std::filesystem::remove(kXyz);
  setBytes(state, text.size());
}
BENCHMARK(xyzImported)->Unit(benchmark::kMillisecond)->MinTime(2);

void xyzSweptPlainly(benchmark::State& state) {
  const std::string& text = xyzText();
  for (auto _ : state) {
    double sum = 0;
    const char* end = text.data() + text.size();
    for (const char* at = text.data(); at != end; ++at) {
      double value = 0;
      at = std::from_chars(at, end, value).ptr;
      sum += value;
    }
    benchmark::DoNotOptimize(sum);
  }
  setBytes(state, text.size());
}
BENCHMARK(xyzSweptPlainly)->Unit(benchmark::kMillisecond)->MinTime(2);

void dikeEditWithHistory(benchmark::State& state) {
  CGlobalKvs model;
  fill(*model.nhdDike, kDikes, kPoints);
  EditHistory history;
  history.start(model, {});
  int number = 0;
  for (auto _ : state) {
    number = number % kDikes + 1;
    model.nhdDike->at(number).points.edit(kPoints / 2).z += 1;
    if (!history.record(model, PageId::dikes, "Z", false, {})) state.SkipWithError("the edit was not seen");
  }
}
BENCHMARK(dikeEditWithHistory)->Unit(benchmark::kMillisecond);

// One dike with so many points, as an import makes it.
void longDikeEditWithHistory(benchmark::State& state) {
  CGlobalKvs model;
  fill(*model.nhdDike, 1, static_cast<int>(state.range(0)));
  EditHistory history;
  history.start(model, {});
  std::size_t place = 0;
  for (auto _ : state) {
    place = (place + 7919) % static_cast<std::size_t>(state.range(0));
    model.nhdDike->at(1).points.edit(place).z += 1;
    if (!history.record(model, PageId::dikes, "Z", false, {})) state.SkipWithError("the edit was not seen");
  }
}
BENCHMARK(longDikeEditWithHistory)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

// The page of 1,000 dikes, the first of them with 100,000 points and selected.
class DikePage {
 public:
  DikePage() {
    constexpr int kPointsOfFirst = 100'000;
    document_.root().nhdDike->SetCount(kDikes);
    for (int i = 0; i < kPointsOfFirst; ++i) document_.root().nhdDike->at(1).points.push_back(pointAt(i));
    document_.root().nhdDike->at(1).crestLevelSpecification = CNhdDikeObjectKvs::kInSpace;
    page_ = makePage("CNHdDikeDlg", document_);
    grid("Dikes").OnCurrentRow(1);
  }
  CV27SetupGridWnd& grid(std::string_view label) { return *page_->form().find(label)->grid; }

 private:
  NoHost host_;
  CV27SetupDoc document_{host_};
  std::unique_ptr<CV27SetupFormView> page_;
};

// All cells of as many rows as a large screen shows.
void dikePageCells(benchmark::State& state, const char* label) {
  constexpr int kRowsShown = 60;
  DikePage page;
  CV27SetupGridWnd& grid = page.grid(label);
  int first = 1;
  for (auto _ : state) {
    for (int row = first; row < first + kRowsShown; ++row) {
      for (int col = 1; col <= grid.GetColCount(); ++col) {
        CellStyle style;
        grid.GetStyleRowCol(row, col, style);
        benchmark::DoNotOptimize(style);
      }
    }
    first = (first + 7) % (grid.GetRowCount() - kRowsShown) + 1;
  }
}
BENCHMARK_CAPTURE(dikePageCells, dikes, "Dikes")->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(dikePageCells, points, "Points")->Unit(benchmark::kMillisecond);

// A point is typed: stored, kept for an undo, and the page shown again.
void dikePageEdit(benchmark::State& state) {
  DikePage page;
  int value = 0;
  for (auto _ : state) {
    if (page.grid("Points").StoreStyleRowCol(50'000, 1, std::to_string(++value)) != 1)
      state.SkipWithError("the edit was not taken");
  }
}
BENCHMARK(dikePageEdit)->Unit(benchmark::kMillisecond);

// Each asks for a crest level file that is there.
void dikesChecked(benchmark::State& state) {
  CNhdDikeKvs dikes(nullptr);
  dikes.SetCount(kDikes);
  std::ofstream(kSetup) << "crest";
  for (int number = 1; number <= kDikes; ++number) {
    dikes.at(number).crestLevelSpecification = CNhdDikeObjectKvs::kInSpaceAndTime;
    dikes.at(number).crestLevelFile = kSetup;
  }
  for (auto _ : state) {
    ValidationList messages;
    if (dikes.Validate(messages, 1) != 0) state.SkipWithError("there are faults");
  }
  std::filesystem::remove(kSetup);
}
BENCHMARK(dikesChecked)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
