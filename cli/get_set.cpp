#include <fmt/format.h>

#include "cli/commands.h"
#include "core/kdl_writer.h"
#include "setup/member_keyword.h"
#include "setup/setting.h"
#include "setup/setup_path.h"

namespace gridbay::cli {
namespace {

struct GetOptions {
  std::string file;
  std::string path;
};

struct SetOptions {
  std::string file;
  std::vector<std::string> settings;
};

int show(const Node& node, const Console& console) {
  if (!node.isSection()) {
    console.out << shownValues(node) << '\n';
    return kClean;
  }
  const Result<std::string> text = kdlText(node);
  if (!text) return console.fail(text.error());
  console.out << *text;
  return kClean;
}

// What a keyword holds now; where the model has none of that path, what the file has there.
int get(const GetOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  if (const Result<MemberKeyword> keyword = findKeyword(setup->model(), options.path, options.file))
    return show(keyword->node(), console);
  if (const Result<const Node*> found = findPath(setup->source(), options.path))
    return show(**found, console);
  const KvsHandle effective = setup->tree(options.file);
  const Result<const Node*> found = findPath(*effective, options.path);
  if (!found) return console.fail(found.error());
  return show(**found, console);
}

int set(const SetOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  for (const std::string& text : options.settings) {
    const Result<Setting> setting = settingOf(text);
    if (!setting) return console.fail(setting.error());
    const Outcome done = applySetting(*setup, *setting, options.file);
    if (!done) return console.fail(done.error());
  }
  return saveSetup(*setup, options.file, console);
}

}  // namespace

void addGet(CLI::App& tool, Action& action) {
  std::shared_ptr<GetOptions> options;
  CLI::App& command = addCommand(tool, action, "get", "Shows a value or section of a setup", get, options);
  command.add_option("FILE", options->file, "The setup")->required();
  command.add_option("PATH", options->path, "As NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth")->required();
}

void addSet(CLI::App& tool, Action& action) {
  std::shared_ptr<SetOptions> options;
  CLI::App& command = addCommand(tool, action, "set", "Changes values of a setup, all or none", set, options);
  command.add_option("FILE", options->file, "The setup")->required();
  command
      .add_option("PATH=VALUE", options->settings,
                  "As NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.01; several numbers as 3,4; a file "
                  "name relative "
                  "to the setup's folder")
      ->required();
}

}  // namespace gridbay::cli
