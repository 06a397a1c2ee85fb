#pragma once

#include <CLI/CLI.hpp>
#include <functional>
#include <limits>
#include <memory>
#include <span>
#include <string>
#include <string_view>

#include "cli/console.h"

namespace gridbay::cli {

// What the chosen command does; set while the command line is read.
using Action = std::function<int(const Console&)>;

// Each adds its command to the tool.
void addConvertRaster(CLI::App& convert, Action& action);
void addConvertSeries(CLI::App& convert, Action& action);
void addConvertTypes(CLI::App& convert, Action& action);
void addInfo(CLI::App& tool, Action& action);
void addNew(CLI::App& tool, Action& action);
void addGet(CLI::App& tool, Action& action);
void addSet(CLI::App& tool, Action& action);
void addBoundaries(CLI::App& tool, Action& action);
void addArea(CLI::App& tool, Action& action);
void addExport(CLI::App& tool, Action& action);
void addValidate(CLI::App& tool, Action& action);
void addFix(CLI::App& tool, Action& action);
void addDiff(CLI::App& tool, Action& action);
void addMerge(CLI::App& tool, Action& action);
void addRun(CLI::App& tool, Action& action);
void addEnsemble(CLI::App& tool, Action& action);
void addCompletion(CLI::App& tool, Action& action);

// The first word of a command line by which a shell asks for completions.
inline constexpr std::string_view kCompleteWords = "complete-words";
// What a word that is being typed can become: `words` are those after the tool's name, the last one as far as
// it is there. A line each on `out`, with a tab and what it is where that is known; nothing where files are
// wanted.
void printCompletions(const CLI::App& tool, std::span<const char* const> words, std::ostream& out);

// Adds a command whose options are held in a struct of its own and handed to `run`.
template <class Options>
CLI::App& addCommand(CLI::App& parent, Action& action, const char* name, const char* help,
                     int (*run)(const Options&, const Console&), std::shared_ptr<Options>& options) {
  options = std::make_shared<Options>();
  CLI::App& command = *parent.add_subcommand(name, help);
  command.callback([&action, run, options] {
    action = [run, options](const Console& console) { return run(*options, console); };
  });
  return command;
}

// The name by which the tool of this edition is called.
std::string_view toolName();

// Options that several commands have.
CLI::Option* addForce(CLI::App& command, bool& force);
// The text that names an item type; `itemType` is a std::string, an optional one, or a list.
std::string itemTypeHelp(std::string_view ofWhat);
CLI::Option* addItemType(CLI::App& command, auto& itemType, std::string_view ofWhat) {
  return command.add_option("--item-type", itemType, itemTypeHelp(ofWhat));
}

// Takes numbers that are finite as 32-bit ones and not below the least one; the tool's own number texts only.
CLI::Validator finite(double least = std::numeric_limits<double>::lowest());
CLI::Validator aboveZero();

}  // namespace gridbay::cli
