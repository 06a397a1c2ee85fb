#include <fmt/format.h>

#include <cstdlib>
#include <filesystem>
#include <optional>

#include "cli/commands.h"
#include "cli/engine_process.h"
#include "cli/programs.h"
#include "cli/run_members.h"
#include "cli/slurm.h"
#include "platform/files/paths.h"

namespace gridbay::cli {
namespace {

constexpr const char* kEngineNames[] = {"gridbay.exe", "gridbay"};
constexpr const char* kEngineVariable = "GRIDBAY_ENGINE";

struct RunOptions {
  std::vector<std::string> files;
  std::string engine;
  std::string statusOf;
  bool slurm = false;
  bool force = false;
};

std::optional<std::string> engineIn(const std::filesystem::path& folder) {
  for (const char* name : kEngineNames) {
    if (const std::string file = (folder / name).string(); isProgram(file)) return file;
  }
  return std::nullopt;
}

std::filesystem::path programFolder() {
  std::error_code error;
  return std::filesystem::read_symlink("/proc/self/exe", error).parent_path();
}

// The engine that the user names, or else the one beside this program, or on the PATH.
Result<std::string> findEngine(const RunOptions& options) {
  const char* variable = std::getenv(kEngineVariable);
  for (const std::string& named : {options.engine, std::string(variable == nullptr ? "" : variable)}) {
    if (named.empty()) continue;
    if (isProgram(named)) return absolutePath(named, {});
    return Failure{fmt::format("There is no engine \"{}\" that can be run", named)};
  }
  if (const auto beside = engineIn(programFolder())) return *beside;
  for (const std::string& folder : foldersOfPrograms()) {
    if (const auto found = engineIn(folder)) return *found;
  }
  return Failure{fmt::format(
      "There is no engine: {} or {} was looked for in {}, and on the PATH. Name one with --engine or "
      "in {}",
      kEngineNames[0], kEngineNames[1], programFolder().string(), kEngineVariable)};
}

// Whether the setup can be started: loadable, and without faults unless they are to be passed over.
int check(const std::string& file, bool force, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(file, &host);
  if (!setup) return console.fail(setup.error());
  ValidationList messages;
  const unsigned faults = setup->model().Validate(messages, 1);
  for (const CMessage& message : messages) console.note(messageLine(message));
  if (faults == 0) return kClean;
  const std::string count = fmt::format("{} fault{}", faults, faults == 1 ? "" : "s");
  if (force) {
    console.note(count + ", started nevertheless");
    return kClean;
  }
  console.note(count + ": not started; --force starts it nevertheless");
  return kFaultsFound;
}

int runOne(const RunOptions& options, const Console& console) {
  const std::string& file = options.files.front();
  if (const int status = check(file, options.force, console); status != kClean) return status;
  const Result<std::string> engine = findEngine(options);
  if (!engine) return console.fail(engine.error());
  console.out.flush();
  const Result<ProcessEnd> end = runProcess({*engine, {absolutePath(file, {})}});
  if (!end) return console.fail(end.error());
  if (end->interrupted) console.note("Stopped");
  return end->status;
}

int run(const RunOptions& options, const Console& console) {
  if (!options.statusOf.empty()) return showRun(options.statusOf, console);
  if (options.files.empty()) return console.fail("FILE is required");
  const bool bySlurm = options.slurm && slurm::isThere();
  if (options.slurm && !bySlurm)
    console.note("There is no sbatch on the PATH: the run is made on this machine");
  if (options.files.size() == 1 && !bySlurm) return runOne(options, console);
  const Result<std::string> engine = findEngine(options);
  if (!engine) return console.fail(engine.error());
  return runMembers({options.files, *engine, bySlurm, options.force}, console);
}

}  // namespace

void addRun(CLI::App& tool, Action& action) {
  std::shared_ptr<RunOptions> options;
  CLI::App& command =
      addCommand(tool, action, "run", "Checks setups and hands them to the engine", run, options);
  command.footer(
      "Of one setup the exit status is the engine's, or 1 for one with faults. Several run side by side, as "
      "many as there are cores, with what each engine says in a folder \"run-N\" beside them; the exit "
      "status "
      "is 1 when one failed.");
  CLI::Option* files = command.add_option("FILE", options->files, "The setups, as they are saved");
  CLI::Option* force = command.add_flag("--force", options->force, "Start them with their faults too");
  CLI::Option* engine = command.add_option(
      "--engine", options->engine,
      "The engine (default: GRIDBAY_ENGINE, gridbay.exe or gridbay beside this program or on the PATH)");
  CLI::Option* bySlurm = command.add_flag("--slurm", options->slurm,
                                          "Hand the setups to Slurm as one job array, and come back at once; "
                                          "SBATCH_PARTITION, SBATCH_TIMELIMIT and "
                                          "the like hold. Without Slurm they run on this machine");
  command
      .add_option("--status", options->statusOf,
                  "Tell how many setups of a run, by its folder, are done, and which have failed")
      ->type_name("FOLDER")
      ->excludes(files)
      ->excludes(force)
      ->excludes(engine)
      ->excludes(bySlurm);
}

}  // namespace gridbay::cli
