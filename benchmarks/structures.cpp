// A model with 1,000 weirs and 1,000 culverts, and 1,000 outputs where it is checked: loaded, saved, checked,
// edited and shown.

#include <benchmark/benchmark.h>
#include <fmt/format.h>

#include <filesystem>

#include "core/kdl_reader.h"
#include "hydrodynamic/result.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "pages/no_host.h"
#include "setup/global_kvs.h"
#include "setup/page_factory.h"
#include "setup/setup_doc.h"
#include "structures/culvert.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

constexpr int kStructures = LineStructure::kMost;
constexpr int kPoints = 20;    // of each polyline
constexpr int kMeasures = 10;  // of each table
constexpr const char* kPath = "/dev/shm/gridbay-bench-structures.v27";

void fill(LineStructure& structure, int number) {
  for (int i = 0; i < kPoints; ++i) {
    structure.x.push_back(400000 + number * 12.25 + i * 0.5);
    structure.y.push_back(6000000 + number * 7.75 + i * 1.5);
  }
  for (int i = 0; i < kMeasures; ++i) {
    structure.level.push_back(0.25F * static_cast<float>(i));
    structure.width.push_back(2 + 0.5F * static_cast<float>(i));
  }
}

void fill(CGlobalKvs& model) {
  model.nhdWeir->SetCount(kStructures);
  model.nhdCulvert->SetCount(kStructures);
  for (int number = 1; number <= kStructures; ++number) {
    fill(model.nhdWeir->at(number), number);
    fill(model.nhdCulvert->at(number), number);
  }
}

std::string textOfModel() {
  CGlobalKvs model;
  fill(model);
  KvsFile file;
  model.Save(file, kPath);
  return *file.text();
}

// From the text of the file to the whole model.
void loadStructures(benchmark::State& state) {
  const std::string text = textOfModel();
  for (auto _ : state) {
    const ReadText read = readKdl(FileText(std::string_view(text)));
    CGlobalKvs model;
    model.Load(&read.tree->root(), kPath);
    if (model.nhdWeir->GetCount() != kStructures || model.nhdCulvert->at(kStructures).x.size() != kPoints)
      state.SkipWithError("not all structures were loaded");
  }
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(text.size()));
}

// With the flush and the rename.
void saveStructures(benchmark::State& state) {
  CGlobalKvs model;
  fill(model);
  for (auto _ : state) {
    KvsFile file;
    model.Save(file, kPath);
    if (!kvsWrite(file, kPath)) state.SkipWithError("the file cannot be written");
  }
  std::filesystem::remove(kPath);
}

// The whole model with as many outputs, and the structures, which its check leaves out.
void validateStructures(benchmark::State& state) {
  CGlobalKvs model;
  fill(model);
  model.nhdResult->outputs.SetCount(kStructures);
  for (auto _ : state) {
    ValidationList messages;
    benchmark::DoNotOptimize(model.Validate(messages, 1) + model.nhdWeir->Validate(messages, 1) +
                             model.nhdCulvert->Validate(messages, 1));
  }
}

class OpenPage {
 public:
  explicit OpenPage(std::string_view pageClass) {
    fill(document_.root());
    document_.RecordEdit(PageId::none, "Structures");
    page_ = makePage(pageClass, document_);
    for (Control& control : page_->form().controls()) {
      if (control.grid != nullptr) grids_.push_back(control.grid);
    }
  }
  CV27SetupDoc& document() { return document_; }
  CV27SetupFormView& page() { return *page_; }
  std::span<CV27SetupGridWnd* const> grids() const { return grids_; }

 private:
  NoHost host_;
  CV27SetupDoc document_{host_};
  std::unique_ptr<CV27SetupFormView> page_;
  std::vector<CV27SetupGridWnd*> grids_;
};

constexpr std::string_view kPages[] = {"CNHdWeirDlg", "CNHdCulvertDlg"};

// The page is laid out, and one screen of each of its grids asked for, further down each time.
void scrollPage(benchmark::State& state) {
  constexpr int kScreen = 25;
  OpenPage open(kPages[state.range(0)]);
  int first = 1;
  for (auto _ : state) {
    std::int64_t found = 0;
    open.page().Refresh();
    for (CV27SetupGridWnd* grid : open.grids()) {
      for (int row = first; row < first + kScreen; ++row) {
        for (int col = 1; col <= grid->GetColCount(); ++col) {
          CellStyle style;
          found += grid->GetStyleRowCol(row, col, style);
          benchmark::DoNotOptimize(style);
        }
      }
    }
    if (found < kScreen) state.SkipWithError("there are no cells");
    first = first % (kStructures - kScreen) + 7;
  }
}

// One cell is edited, and the step kept for undo.
void editCell(benchmark::State& state) {
  OpenPage open(kPages[state.range(0)]);
  int step = 0;
  for (auto _ : state) {
    ++step;
    if (open.grids()[0]->StoreStyleRowCol(2 + step % kStructures, 1, "S" + std::to_string(step)) == 0)
      state.SkipWithError("the edit was refused");
  }
}

BENCHMARK(loadStructures)->Unit(benchmark::kMillisecond);
BENCHMARK(saveStructures)->Unit(benchmark::kMillisecond);
BENCHMARK(validateStructures)->Unit(benchmark::kMillisecond);
BENCHMARK(scrollPage)->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond);
BENCHMARK(editCell)->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
