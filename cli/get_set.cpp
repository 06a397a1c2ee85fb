#include <fmt/format.h>

#include "cli/commands.h"
#include "cli/member_keyword.h"
#include "cli/setup_path.h"
#include "core/kdl_writer.h"

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

struct Setting {
  std::string path;
  std::string value;
};

Result<Setting> settingOf(const std::string& text) {
  const std::size_t equals = text.find('=');
  if (equals == text.npos) return Failure{fmt::format("\"{}\" is not of the form PATH=VALUE", text)};
  return Setting{text.substr(0, equals), text.substr(equals + 1)};
}

// The engine's options are not in the model: a save passes on what stands in the file that was read.
Outcome setOption(SetupFile& setup, const Setting& setting) {
  const Result<const Node*> keyword = findPath(setup.source(), setting.path);
  if (!keyword) return Failure{keyword.error()};
  if ((*keyword)->isSection())
    return Failure{fmt::format("\"{}\" is a section; name a keyword in it", setting.path)};
  ParameterTree keeper;
  const Result<std::vector<Value>> values = valuesOfText(**keyword, setting.value, false, keeper);
  if (!values) return Failure{values.error()};
  setup.replaceSource(withValues(setup.source(), *keyword, *values));
  return {};
}

Outcome setMember(SetupFile& setup, const Setting& setting, const std::string& file) {
  Result<MemberKeyword> keyword = findKeyword(setup.model(), setting.path, file);
  if (!keyword) {
    const KvsHandle effective = setup.tree(file);
    const Result<const Node*> found = findPath(*effective, setting.path);
    return found && (*found)->isSection()
               ? Failure{fmt::format("\"{}\" is a section; name a keyword in it", setting.path)}
               : Failure{found ? keyword.error() : found.error()};
  }
  ParameterTree keeper;
  const Result<std::vector<Value>> values =
      valuesOfText(keyword->node(), setting.value, keyword->takesAnyNumber(), keeper);
  if (!values) return Failure{values.error()};
  if (keyword->set(*values)) return {};
  return Failure{fmt::format("{} cannot be {} here: it stays {}", setting.path, setting.value,
                             shownValues(keyword->node()))};
}

int set(const SetOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  for (const std::string& text : options.settings) {
    const Result<Setting> setting = settingOf(text);
    if (!setting) return console.fail(setting.error());
    const Outcome done =
        isOption(setting->path) ? setOption(*setup, *setting) : setMember(*setup, *setting, options.file);
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
