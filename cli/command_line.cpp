#include "cli/command_line.h"

#include <string>

#include "cli/commands.h"
#include "core/edition.h"

namespace gridbay::cli {

int runCommandLine(int argc, const char* const* argv, std::ostream& out, std::ostream& err) {
  const Console console{out, err};
  const std::string kind(theEdition.fileKind);
  CLI::App tool("Prepares, checks and starts setups (*." + kind + ") of the " +
                    std::string(theEdition.editorName.format) +
                    ".\nExit status: 0 clean, 1 faults found, 2 could not do it.",
                theEdition.wetlandSweepKit ? "v27setup-wsk" : "v27setup");
  tool.set_version_flag("--version", "0.1.0");
  tool.require_subcommand(1);
  Action action;
  CLI::App& convert = *tool.add_subcommand("convert", "Makes data files from rasters and text series");
  convert.require_subcommand(1);
  addConvertRaster(convert, action);
  addConvertSeries(convert, action);
  addInfo(tool, action);
  addNew(tool, action);
  addGet(tool, action);
  addSet(tool, action);
  addBoundaries(tool, action);
  addValidate(tool, action);
  addRun(tool, action);
  try {
    tool.parse(argc, argv);
  } catch (const CLI::ParseError& error) {
    return tool.exit(error, out, err) == 0 ? kClean : kCouldNotDoIt;
  }
  return action(console);
}

}  // namespace gridbay::cli
