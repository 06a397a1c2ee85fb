#include "batch/ensemble.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>

#include "cli/commands.h"
#include "cli/progress.h"
#include "cli/stop_signals.h"

namespace gridbay::cli {
namespace {

struct EnsembleOptions {
  std::string table;
  std::string base;
  std::string folder;
  bool force = false;
};

int ensemble(const EnsembleOptions& options, const Console& console) {
  Result<EnsembleTable> table =
      readEnsembleTable(options.table, std::filesystem::path(options.base).stem().string());
  if (!table) return console.fail(table.error());
  const Ensemble asked{std::move(*table), options.base, options.folder, options.force};
  const StopSignals signals;
  ConsoleMessageHost host(console);
  Result<EnsembleResult> result = [&] {
    Progress progress(console, "Members", asked.table.members.size());
    return makeEnsemble(
        asked, host,
        {[&](std::size_t done) { progress.reached(done); }, [&] { return signals.isStopped(); }});
  }();
  if (!result) return console.fail(result.error());
  const auto faulty =
      std::ranges::count_if(result->members, [](const MemberReport& member) { return !member.isClean(); });
  console.out << fmt::format("{}: {} member{}, {} with faults; see {}\n", options.folder,
                             result->members.size(), result->members.size() == 1 ? "" : "s", faulty,
                             asked.csvReport());
  constexpr std::size_t kMostWarnings = 20;
  for (std::size_t i = 0; i < std::min(result->warnings.size(), kMostWarnings); ++i)
    console.note("Warning: " + result->warnings[i]);
  if (result->warnings.size() > kMostWarnings)
    console.note(fmt::format("... and {} more of these; the reports have all",
                             result->warnings.size() - kMostWarnings));
  if (result->others > 0)
    console.note(fmt::format("{} holds {} other setup{}, of which the reports tell nothing", options.folder,
                             result->others, result->others == 1 ? "" : "s"));
  if (result->isStopped)
    return console.fail(
        fmt::format("Stopped before the other {}", asked.table.members.size() - result->members.size()));
  return faulty == 0 ? kClean : kFaultsFound;
}

}  // namespace

void addEnsemble(CLI::App& tool, Action& action) {
  std::shared_ptr<EnsembleOptions> options;
  CLI::App& command = addCommand(
      tool, action, "ensemble", "Makes setups that differ in what a table says, and checks them on all cores",
      ensemble, options);
  command
      .add_option("TABLE", options->table,
                  "A CSV file with a row for each member and, below a first row with their paths (as \"set\" "
                  "takes them), a column for each value; a first column \"name\" has the members' names. An "
                  "empty cell leaves what BASE has; data files are named from the folder of BASE")
      ->required();
  command.add_option("BASE", options->base, "The setup that the members differ from")->required();
  command
      .add_option("FOLDER", options->folder,
                  "Where the members are made, with report.csv and report.json. What their engines make "
                  "lies there too, with the member's name before its own")
      ->required();
  command.add_flag("--force", options->force, "Replace files that are there");
}

}  // namespace gridbay::cli
