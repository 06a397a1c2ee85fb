#include <fmt/format.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <optional>

#include "cli/commands.h"
#include "cli/engine_process.h"
#include "platform/files/paths.h"

namespace gridbay::cli {
namespace {

constexpr const char* kEngineNames[] = {"gridbay.exe", "gridbay"};
constexpr const char* kEngineVariable = "GRIDBAY_ENGINE";

struct Options {
  std::string file;
  std::string engine;
  bool force = false;
};

bool isProgram(const std::filesystem::path& path) {
  std::error_code error;
  return std::filesystem::is_regular_file(path, error) && ::access(path.c_str(), X_OK) == 0;
}

std::optional<std::string> engineIn(const std::filesystem::path& folder) {
  for (const char* name : kEngineNames) {
    if (isProgram(folder / name)) return (folder / name).string();
  }
  return std::nullopt;
}

std::filesystem::path programFolder() {
  std::error_code error;
  return std::filesystem::read_symlink("/proc/self/exe", error).parent_path();
}

// The engine that the user names, or else the one beside this program, or on the PATH.
Result<std::string> findEngine(const Options& options) {
  const char* variable = std::getenv(kEngineVariable);
  for (const std::string& named : {options.engine, std::string(variable == nullptr ? "" : variable)}) {
    if (named.empty()) continue;
    if (isProgram(named)) return absolutePath(named, {});
    return Failure{fmt::format("There is no engine \"{}\" that can be run", named)};
  }
  if (const auto beside = engineIn(programFolder())) return *beside;
  const char* variablePath = std::getenv("PATH");
  const std::string path = variablePath == nullptr ? "" : variablePath;
  for (std::size_t start = 0; start < path.size();) {
    const std::size_t end = std::min(path.find(':', start), path.size());
    if (const auto found = engineIn(path.substr(start, end - start))) return *found;
    start = end + 1;
  }
  return Failure{fmt::format(
      "There is no engine: {} or {} was looked for in {}, and on the PATH. Name one with --engine or "
      "in {}",
      kEngineNames[0], kEngineNames[1], programFolder().string(), kEngineVariable)};
}

// Whether the setup can be started: loadable, and without faults unless they are to be passed over.
int check(const Options& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  ValidationList messages;
  const unsigned faults = setup->model().Validate(messages, 1);
  for (const CMessage& message : messages) console.note(messageLine(message));
  if (faults == 0) return kClean;
  const std::string count = fmt::format("{} fault{}", faults, faults == 1 ? "" : "s");
  if (options.force) {
    console.note(count + ", started nevertheless");
    return kClean;
  }
  console.note(count + ": not started; --force starts it nevertheless");
  return kFaultsFound;
}

int run(const Options& options, const Console& console) {
  if (const int status = check(options, console); status != kClean) return status;
  const Result<std::string> engine = findEngine(options);
  if (!engine) return console.fail(engine.error());
  console.out.flush();
  const Result<ProcessEnd> end = runProcess(*engine, {absolutePath(options.file, {})});
  if (!end) return console.fail(end.error());
  if (end->interrupted) console.note("Stopped");
  return end->status;
}

}  // namespace

void addRun(CLI::App& tool, Action& action) {
  std::shared_ptr<Options> options;
  CLI::App& command = addCommand(tool, action, "run",
                                 "Checks a setup and hands it to the engine; the exit status is the "
                                 "engine's, or 1 for a setup with faults",
                                 run, options);
  command.add_option("FILE", options->file, "The setup, as it is saved")->required();
  command.add_flag("--force", options->force, "Start it with its faults too");
  command.add_option(
      "--engine", options->engine,
      "The engine (default: GRIDBAY_ENGINE, gridbay.exe or gridbay beside this program or on the PATH)");
}

}  // namespace gridbay::cli
