#pragma once

#include <CLI/CLI.hpp>
#include <functional>
#include <memory>
#include <string>

#include "cli/console.h"

namespace gridbay::cli {

// What the chosen command does; set while the command line is read.
using Action = std::function<int(const Console&)>;

// Each adds its command to the tool.
void addConvertRaster(CLI::App& convert, Action& action);
void addConvertSeries(CLI::App& convert, Action& action);
void addInfo(CLI::App& tool, Action& action);
void addNew(CLI::App& tool, Action& action);
void addGet(CLI::App& tool, Action& action);
void addSet(CLI::App& tool, Action& action);
void addBoundaries(CLI::App& tool, Action& action);
void addValidate(CLI::App& tool, Action& action);
void addRun(CLI::App& tool, Action& action);

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

}  // namespace gridbay::cli
