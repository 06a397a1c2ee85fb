// The ecological model: its definition file, the lists that are made of it, and its pages.

#include <benchmark/benchmark.h>
#include <fmt/format.h>

#include <filesystem>
#include <fstream>

#include "basic/bathymetry.h"
#include "ecology/constants.h"
#include "ecology/model_definition.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "pages/no_host.h"
#include "setup/page_factory.h"
#include "setup/setup_doc.h"

namespace gridbay {
namespace {

// A definition with so many declarations: a tenth each state variables, equations' texts with them, forcings
// and processes, the rest constants.
class DefinitionFile {
 public:
  explicit DefinitionFile(int declarations)
      : path_((std::filesystem::temp_directory_path() / fmt::format("bench_{}.biorig", declarations))
                  .string()) {
    std::ofstream file(path_);
    const int tenth = declarations / 10;
    file << "BIO_RIG_SETUP {\n DESCRIPTION \"Benchmark\"\n";
    list(file, "STATE_VARIABLES", "STATE_VARIABLE", tenth, " TRANSPORT \"ADVECTION_DISPERSION\"\n");
    list(file, "CONSTANTS", "CONSTANT", declarations - 3 * tenth, " IS_USER_SPECIFIED \"YES\"\n");
    list(file, "FORCINGS", "FORCING", tenth, " IS_USER_SPECIFIED \"NO\"\n BUILT_IN_ID 7\n");
    list(file, "PROCESSES", "PROCESS", tenth, " OUTPUT \"YES\"\n EXPRESSION \"a * b\"\n");
    file << "STATE_VARIABLE_EQUATIONS {\n";
    for (int n = 1; n <= tenth; ++n)
      file << fmt::format("STATE_VARIABLE_EQUATION_{0} {{\n S{0} \"decay - growth\"\n}}\n", n);
    file << "}\n}\n";
  }
  DefinitionFile(const DefinitionFile&) = delete;
  DefinitionFile& operator=(const DefinitionFile&) = delete;
  ~DefinitionFile() { std::filesystem::remove(path_); }
  const std::string& path() const { return path_; }

 private:
  static void list(std::ofstream& file, std::string_view section, std::string_view item, int count,
                   std::string_view further) {
    file << section << " {\n";
    for (int n = 1; n <= count; ++n)
      file << fmt::format(
          "{0}_{1} {{\n SYMBOL \"S{1}\"\n ID {1}\n DESCRIPTION \"About number {1}\"\n UNIT \"g/m3\"\n"
          " DEFAULT_VALUE 1.5\n MIN_VALUE 0.0\n MAX_VALUE 10.0\n{2}}}\n",
          item, n, further);
    file << "}\n";
  }
  std::string path_;
};

void readDefinition(benchmark::State& state) {
  const DefinitionFile file(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    if (!readModelDefinition(file.path())->fault.empty()) state.SkipWithError("not read");
  }
  state.SetBytesProcessed(state.iterations() * static_cast<int64_t>(std::filesystem::file_size(file.path())));
}
BENCHMARK(readDefinition)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);

// Read, and all lists of a model with 3 areas made anew.
void buildEcologicalLists(benchmark::State& state) {
  const DefinitionFile file(static_cast<int>(state.range(0)));
  CGlobalKvs root;
  root.bathymetry->SetNoAreas(3);
  UFileName name;
  name = file.path();
  for (auto _ : state) {
    root.wqsModelDefinition->Choose(name);
    if (root.wqsConstants->GetCount() == 0) state.SkipWithError("no lists");
  }
}
BENCHMARK(buildEcologicalLists)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);

// A page laid out, and a screen of its cells at the end of its grid.
void openEcologicalPages(benchmark::State& state) {
  const DefinitionFile file(static_cast<int>(state.range(0)));
  NoHost host;
  CV27SetupDoc document(host);
  document.root().bathymetry->SetNoAreas(3);
  UFileName name;
  name = file.path();
  document.root().wqsModelDefinition->Choose(name);
  for (auto _ : state) {
    for (const char* pageClass : {"CWQSModelDefinitionDlg", "CWQSStateVariablesDlg",
                                  "CWQSInitialConditionsDlg", "CWQSConstantsDlg", "CWQSForcingsDlg"}) {
      const auto page = makePage(pageClass, document);
      for (const Control& control : page->form().controls()) {
        if (control.grid == nullptr) continue;
        const int rows = control.grid->GetRowCount();
        for (int row = 1; row <= rows; ++row) benchmark::DoNotOptimize(control.grid->GetRowLook(row));
        for (int row = std::max(1, rows - 40); row <= rows; ++row) {
          for (int col = 1; col <= control.grid->GetColCount(); ++col) {
            CellStyle cell;
            benchmark::DoNotOptimize(control.grid->GetStyleRowCol(row, col, cell));
          }
        }
      }
    }
  }
}
BENCHMARK(openEcologicalPages)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay
