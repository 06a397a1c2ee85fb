#include "cli/command_line.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <memory>
#include <optional>
#include <span>
#include <string>

#include "cli/commands.h"
#include "core/edition.h"
#include "core/number_text.h"

namespace gridbay::cli {
namespace {

// A command line as a shell would take it again.
std::string commandLineText(const std::string& tool, std::span<const char* const> words) {
  std::string text = tool;
  for (const char* const word : words) text += ' ' + shellText(word);
  return text;
}

// Help without the parser's own marks: the usage tells what is needed, and a refusal what excludes what.
class HelpFormatter final : public CLI::Formatter {
 public:
  std::string make_option_opts(const CLI::Option* option) const override {
    constexpr std::string_view kNeeded = " REQUIRED";
    std::string text = Formatter::make_option_opts(option);
    text.erase(std::min(text.find(" Excludes:"), text.size()));
    if (text.ends_with(kNeeded)) text.erase(text.size() - kNeeded.size());
    return text;
  }
};

}  // namespace

CLI::Option* addForce(CLI::App& command, bool& force) {
  return command.add_flag("--force", force, "Replace a file that is there");
}

std::string itemTypeHelp(std::string_view ofWhat) {
  return fmt::format(
      "Item type of {}: its code, its name or the beginning of it (\"{} convert types\" lists them)", ofWhat,
      toolName());
}

CLI::Validator finite(double least) {
  return {[least](std::string& text) {
            const std::optional<double> number = doubleOfText(text);
            constexpr double kMost = std::numeric_limits<float>::max();
            if (!number || !(std::abs(*number) <= kMost))
              return fmt::format("\"{}\" is no finite number", text);
            return *number < least ? fmt::format("{} is below {:g}", text, least) : std::string();
          },
          ""};
}

CLI::Validator aboveZero() {
  return {[](std::string& text) {
            const std::string fault = finite()(text);
            if (!fault.empty() || *doubleOfText(text) > 0) return fault;
            return fmt::format("{} is not above 0", text);
          },
          ""};
}

std::string_view toolName() {
  return theEdition.wetlandSweepKit ? "v27setup-wsk" : "v27setup";
}

int runCommandLine(int argc, const char* const* argv, std::ostream& out, std::ostream& err) {
  const std::string kind(theEdition.fileKind);
  CLI::App tool("Prepares, checks and starts setups (*." + kind + ") of the " +
                    std::string(theEdition.editorName.format) +
                    ".\nExit status: 0 clean, 1 faults found, 2 could not do it.",
                std::string(toolName()));
  tool.formatter(std::make_shared<HelpFormatter>());
  tool.set_version_flag("--version", GRIDBAY_VERSION);
  tool.require_subcommand(1);
  Action action;
  CLI::App& convert = *tool.add_subcommand("convert", "Makes data files from rasters and text series");
  convert.require_subcommand(1);
  addConvertRaster(convert, action);
  addConvertSeries(convert, action);
  addConvertTypes(convert, action);
  addInfo(tool, action);
  addNew(tool, action);
  addGet(tool, action);
  addSet(tool, action);
  addBoundaries(tool, action);
  addArea(tool, action);
  addExport(tool, action);
  addValidate(tool, action);
  addFix(tool, action);
  addDiff(tool, action);
  addMerge(tool, action);
  addRun(tool, action);
  addEnsemble(tool, action);
  addCompletion(tool, action);
  const std::span<const char* const> words(argv + 1, argv + std::max(argc, 1));
  if (!words.empty() && words[0] == kCompleteWords) {
    printCompletions(tool, words.subspan(1), out);
    return kClean;
  }
  try {
    tool.parse(argc, argv);
  } catch (const CLI::ParseError& error) {
    return tool.exit(error, out, err) == 0 ? kClean : kCouldNotDoIt;
  }
  return action(Console{out, err, commandLineText(tool.get_name(), words)});
}

}  // namespace gridbay::cli
