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

int run(const Options& options, const Console& console) {
  if (!isReadableFile(options.file)) return console.fail(fmt::format("cannot read \"{}\"", options.file));
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
  CLI::App& command = addCommand(
      tool, action, "run", "Hands a setup to the engine; the exit status is the engine's", run, options);
  command.add_option("FILE", options->file, "The setup, as it is saved")->required();
  command.add_option(
      "--engine", options->engine,
      "The engine (default: GRIDBAY_ENGINE, gridbay.exe or gridbay beside this program or on the PATH)");
}

}  // namespace gridbay::cli
