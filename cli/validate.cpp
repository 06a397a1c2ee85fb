#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "cli/advice_report.h"
#include "cli/commands.h"
#include "setup/dlg_enumerator.h"
#include "setup/page_places.h"

namespace gridbay::cli {
namespace {

struct ValidateOptions {
  std::string file;
  bool json = false;
  bool advice = false;
};

// With advice the messages name their pages, and what they speak of, too.
std::string lineOf(const CMessage& message, bool namesPages) {
  if (!namesPages) return messageLine(message);
  return fmt::format("{}, severity {}: {}", placeText(placeOfMessage(message)),
                     static_cast<int>(message.severity), message.text);
}

nlohmann::ordered_json jsonOf(const CMessage& message, bool namesPages) {
  nlohmann::ordered_json json{{"page", static_cast<int>(message.page)}};
  if (namesPages) {
    json["pageName"] = CDlgEnumerator().GetCaption(static_cast<std::int32_t>(message.page));
    json["thing"] = thingOf(message.page, message.entries);
  }
  json["severity"] = static_cast<int>(message.severity);
  json["text"] = message.text;
  return json;
}

int validate(const ValidateOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  ValidationList messages;
  const unsigned faults = setup->model().Validate(messages, 1);
  const std::vector<Advice> found = options.advice ? adviceOn(*setup, options.file) : std::vector<Advice>();
  if (options.json) {
    nlohmann::ordered_json list = nlohmann::ordered_json::array();
    for (const CMessage& message : messages) list.push_back(jsonOf(message, options.advice));
    nlohmann::ordered_json report{{"messages", std::move(list)}, {"faults", faults}};
    if (options.advice) {
      report["advice"] = nlohmann::ordered_json::array();
      for (std::size_t i = 0; i < found.size(); ++i) report["advice"].push_back(adviceJson(found[i], i + 1));
    }
    console.out << report.dump(2, ' ', false, nlohmann::json::error_handler_t::replace) << '\n';
  } else {
    for (const CMessage& message : messages) console.out << lineOf(message, options.advice) << '\n';
    console.out << fmt::format("{} fault{}\n", faults, faults == 1 ? "" : "s");
    for (std::size_t i = 0; i < found.size(); ++i) console.out << adviceText(found[i], i + 1, options.file);
    if (options.advice && found.empty()) console.out << "no advice\n";
  }
  return faults == 0 ? kClean : kFaultsFound;
}

}  // namespace

void addValidate(CLI::App& tool, Action& action) {
  std::shared_ptr<ValidateOptions> options;
  CLI::App& command = addCommand(tool, action, "validate", "Checks a setup and the data files that it names",
                                 validate, options);
  command.add_option("FILE", options->file, "The setup")->required();
  command.add_flag("--json", options->json, "The messages as JSON");
  command.add_flag(
      "--advice", options->advice,
      "What is doubtful too, by numbers, with fixes (see \"fix\"); the exit status stays that of the faults");
}

}  // namespace gridbay::cli
