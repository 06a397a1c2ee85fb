// Advice on a setup, and the command that makes its fixes.

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "advice/advisor.h"
#include "advice/fix_files.h"
#include "advice/removal.h"
#include "cli/advice_report.h"
#include "cli/commands.h"
#include "setup/dlg_enumerator.h"
#include "setup/member_keyword.h"
#include "setup/setup_path.h"

namespace gridbay::cli {
namespace {

struct FixOptions {
  std::string file;
  std::int64_t number = 0;
};

std::string valueAt(SetupFile& setup, const std::string& keyword, const std::string& path) {
  const Result<MemberKeyword> found = findKeyword(setup.model(), keyword, path);
  return found ? shownValues(found->node()) : std::string();
}

// As the file has it, which a save may write in another way; what it lacks as the model has it.
std::string valueOnFile(SetupFile& setup, const std::string& keyword, const std::string& path) {
  const Node* node = nodeAt(setup.source(), keyword);
  return node != nullptr && !node->isSection() ? shownValues(*node) : valueAt(setup, keyword, path);
}

int fix(const FixOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  const std::vector<Advice> found = adviceOn(*setup, options.file);
  if (options.number < 1 || options.number > std::ssize(found)) {
    return console.fail(fmt::format(
        "There is no advice {}: there {} {}. \"{} validate --advice {}\" lists them", options.number,
        found.size() == 1 ? "is" : "are", found.empty() ? "none" : std::to_string(found.size()), toolName(),
        shellText(options.file)));
  }
  const Advice& advice = found[static_cast<std::size_t>(options.number) - 1];
  std::vector<std::string> before;
  for (const Setting& setting : advice.fix.settings)
    before.push_back(valueOnFile(*setup, setting.path, options.file));
  if (const Outcome done = makeFix(setup->model(), advice.fix, options.file); !done)
    return console.fail(done.error());
  if (const int status = saveSetup(*setup, options.file, console); status != kClean) {
    removeFiles(advice.fix.files);
    return status;
  }
  console.out << advice.fix.name << '\n';
  for (const AdviceFile& file : advice.fix.files)
    console.out << fmt::format("  made {} of {}\n", file.to, file.from);
  for (std::size_t i = 0; i < before.size(); ++i) {
    const std::string& path = advice.fix.settings[i].path;
    console.out << fmt::format("  {}: {} -> {}\n", path, before[i], valueAt(*setup, path, options.file));
  }
  return kClean;
}

nlohmann::ordered_json siteJson(const AdviceSite& site) {
  nlohmann::ordered_json json = nlohmann::ordered_json::object();
  if (!site.points.empty()) {
    json["area"] = site.area;
    json["points"] = nlohmann::ordered_json::array();
    for (const GridPoint& point : site.points) json["points"].push_back({point.j, point.k});
  }
  if (!site.mapPoints.empty()) {
    json["projection"] = site.projection;
    json["coordinates"] = nlohmann::ordered_json::array();
    for (const auto& [easting, northing] : site.mapPoints) json["coordinates"].push_back({easting, northing});
  }
  return json;
}

}  // namespace

std::vector<Advice> adviceOn(SetupFile& setup, const std::string& path) {
  return Advisor().lookThoroughly(setup.model(), path, &setup.source());
}

std::string placeText(const PagePlace& place) {
  const auto id = static_cast<std::int32_t>(place.page);
  const std::string_view caption = CDlgEnumerator().GetCaption(id);
  const std::string page =
      caption.empty() ? fmt::format("page {}", id) : fmt::format("page {} ({})", id, caption);
  return place.thing.empty() ? page : page + ", " + place.thing;
}

std::string adviceText(const Advice& advice, std::size_t number, const std::string& path) {
  const std::string text =
      fmt::format("advice {}, {}: {} {}\n", number, placeText(advice.place), advice.doubt, advice.reason);
  return text +
         fmt::format("  fix: {} ({} fix {} {})\n", advice.fix.name, toolName(), shellText(path), number);
}

nlohmann::ordered_json adviceJson(const Advice& advice, std::size_t number) {
  nlohmann::ordered_json json{
      {"number", number},
      {"kind", advice.kind},
      {"page", static_cast<int>(advice.place.page)},
      {"pageName", CDlgEnumerator().GetCaption(static_cast<std::int32_t>(advice.place.page))},
      {"thing", advice.place.thing},
      {"keyword", advice.place.keyword},
      {"doubt", advice.doubt},
      {"reason", advice.reason},
      {"site", siteJson(advice.site)}};
  nlohmann::ordered_json settings = nlohmann::ordered_json::array();
  for (const Setting& setting : advice.fix.settings)
    settings.push_back({{"path", setting.path}, {"value", setting.value}});
  nlohmann::ordered_json files = nlohmann::ordered_json::array();
  for (const AdviceFile& file : advice.fix.files) files.push_back({{"from", file.from}, {"to", file.to}});
  json["fix"] = {{"name", advice.fix.name}, {"settings", std::move(settings)}, {"files", std::move(files)}};
  json["fix"]["removes"] = nullptr;
  if (advice.fix.removal) json["fix"]["removes"] = textOf(*advice.fix.removal);
  return json;
}

void addFix(CLI::App& tool, Action& action) {
  std::shared_ptr<FixOptions> options;
  CLI::App& command =
      addCommand(tool, action, "fix", "Makes the fix of an advice and saves the setup", fix, options);
  command.add_option("FILE", options->file, "The setup")->required();
  command.add_option("NUMBER", options->number, "The advice, by its number in \"validate --advice\"")
      ->required();
}

}  // namespace gridbay::cli
