// What differs between two setups.

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "cli/commands.h"
#include "compare/setup_difference.h"

namespace gridbay::cli {
namespace {

using Json = nlohmann::ordered_json;

struct DiffOptions {
  std::string own;
  std::string other;
  bool asWritten = false;
  bool keywords = false;
  bool json = false;
};

Json jsonOf(const std::optional<std::string>& value) {
  return value ? Json(*value) : Json(nullptr);
}

Json jsonOf(const Difference& difference) {
  return {{"page", difference.page},     {"pageName", difference.pageName}, {"thing", difference.thing},
          {"a", jsonOf(difference.own)}, {"b", jsonOf(difference.other)},   {"row", difference.row},
          {"column", difference.column}, {"keywords", difference.keywords}};
}

Json jsonOf(const KeywordDifference& keyword) {
  return {{"path", keyword.path},
          {"section", keyword.isSection},
          {"a", jsonOf(keyword.own)},
          {"b", jsonOf(keyword.other)}};
}

void printJson(const SetupDifference& found, const DiffOptions& options, const Console& console) {
  Json report{
      {"a", options.own}, {"b", options.other}, {"differences", Json::array()}, {"keywords", Json::array()}};
  for (const Difference& difference : found.differences) report["differences"].push_back(jsonOf(difference));
  for (const KeywordDifference& keyword : found.keywords) report["keywords"].push_back(jsonOf(keyword));
  console.out << report.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

std::string words(const std::optional<std::string>& own, const std::optional<std::string>& other) {
  return wordsOf(shortened(own), shortened(other), "A", "B");
}

void printKeywords(const SetupDifference& found, const Console& console) {
  for (const KeywordDifference& keyword : found.keywords)
    console.out << fmt::format("{}: {}\n", keyword.path, words(keyword.own, keyword.other));
}

void printWords(const SetupDifference& found, const DiffOptions& options, const Console& console) {
  console.out << fmt::format("A: {}\nB: {}\n", options.own, options.other);
  std::string page;
  for (const Difference& difference : found.differences) {
    const std::string& name = difference.page == 0 ? "On no page" : difference.pageName;
    if (name != page) console.out << name << '\n';
    page = name;
    console.out << fmt::format("  {}{}{}\n", difference.thing.empty() ? "the page is" : difference.thing,
                               difference.thing.empty() ? " " : ": ",
                               words(difference.own, difference.other));
  }
}

int diff(const DiffOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> own = SetupFile::open(options.own, &host);
  if (!own) return console.fail(own.error());
  const std::string& otherPath = options.asWritten ? options.own : options.other;
  Result<SetupFile> other = SetupFile::open(options.other, &host, otherPath);
  if (!other) return console.fail(other.error());
  SetupOnDisk a{std::move(*own), options.own};
  SetupOnDisk b{std::move(*other), options.other};
  const SetupDifference found = compareSetups(a, b);
  if (options.json) {
    printJson(found, options, console);
  } else if (options.keywords) {
    printKeywords(found, console);
  } else if (!found.isSame()) {
    printWords(found, options, console);
  }
  return found.isSame() ? kClean : kFaultsFound;
}

}  // namespace

void addDiff(CLI::App& tool, Action& action) {
  std::shared_ptr<DiffOptions> options;
  CLI::App& command = addCommand(
      tool, action, "diff",
      "Shows what differs between two setups, in the words of their pages; exit status 0 for nothing, 1 "
      "for something, 2 for trouble",
      diff, options);
  command.add_option("A", options->own, "A setup")->required();
  command.add_option("B", options->other, "Another one")->required();
  command.add_flag(
      "--as-written", options->asWritten,
      "Compare file names as they are written, and not where they lead, as for two versions of one "
      "setup in different folders");
  command.add_flag("--keywords", options->keywords, "By the keywords of the file, which \"set\" takes");
  command.add_flag("--json", options->json, "Both as JSON");
}

}  // namespace gridbay::cli
