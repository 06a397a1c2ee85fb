#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "cli/commands.h"

namespace gridbay::cli {
namespace {

struct Options {
  std::string file;
  bool json = false;
};

int validate(const Options& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  ValidationList messages;
  const unsigned faults = setup->model().Validate(messages, 1);
  if (options.json) {
    nlohmann::ordered_json list = nlohmann::ordered_json::array();
    for (const CMessage& message : messages) {
      list.push_back({{"page", static_cast<int>(message.page)},
                      {"severity", static_cast<int>(message.severity)},
                      {"text", message.text}});
    }
    const nlohmann::ordered_json report{{"messages", std::move(list)}, {"faults", faults}};
    console.out << report.dump(2, ' ', false, nlohmann::json::error_handler_t::replace) << '\n';
  } else {
    for (const CMessage& message : messages) console.out << messageLine(message) << '\n';
    console.out << fmt::format("{} fault{}\n", faults, faults == 1 ? "" : "s");
  }
  return faults == 0 ? kClean : kFaultsFound;
}

}  // namespace

void addValidate(CLI::App& tool, Action& action) {
  std::shared_ptr<Options> options;
  CLI::App& command = addCommand(tool, action, "validate", "Checks a setup and the data files that it names",
                                 validate, options);
  command.add_option("FILE", options->file, "The setup")->required();
  command.add_flag("--json", options->json, "The messages as JSON");
}

}  // namespace gridbay::cli
