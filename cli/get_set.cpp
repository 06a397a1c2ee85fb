#include <fmt/format.h>

#include "cli/commands.h"
#include "cli/setup_path.h"
#include "core/kdl_writer.h"
#include "core/number_text.h"

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

// What the file says, or where it says nothing the value that then stands.
int get(const GetOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  if (const Result<const Node*> found = findPath(setup->source(), options.path))
    return show(**found, console);
  const KvsHandle effective = setup->tree(options.file);
  const Result<const Node*> found = findPath(*effective, options.path);
  if (!found) return console.fail(found.error());
  return show(**found, console);
}

// Whether the values came through the model: an edition may have its own.
bool stands(const Node& keyword, const std::vector<Value>& wanted) {
  const std::span<const Value> now = keyword.values();
  return std::ranges::equal(now, wanted, [](const Value& a, const Value& b) {
    if (a.kind() == ValueKind::real) return floatOfText(a.text()) == floatOfText(b.text());
    return a.text() == b.text();
  });
}

int set(const SetOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> opened = SetupFile::open(options.file, &host);
  if (!opened) return console.fail(opened.error());
  SetupFile setup = std::move(*opened);
  for (const std::string& setting : options.settings) {
    const std::size_t equals = setting.find('=');
    if (equals == setting.npos)
      return console.fail(fmt::format("\"{}\" is not of the form PATH=VALUE", setting));
    const std::string path = setting.substr(0, equals);
    const KvsHandle now = setup.tree(options.file);
    const Result<const Node*> keyword = findPath(*now, path);
    if (!keyword) return console.fail(keyword.error());
    if ((*keyword)->isSection())
      return console.fail(fmt::format("\"{}\" is a section; name a keyword in it", path));
    ParameterTree keeper;
    const Result<std::vector<Value>> values = valuesOfText(**keyword, setting.substr(equals + 1), keeper);
    if (!values) return console.fail(values.error());
    // A new count has no sections for its new items yet: what the load says of that is no fault here.
    CollectingMessageHost expected;
    SetupFile changed = SetupFile::fromTree(withValues(*now, *keyword, *values), options.file, &expected);
    const KvsHandle result = changed.tree(options.file);
    const Result<const Node*> there = findPath(*result, path);
    if (!there || !stands(**there, *values)) {
      return console.fail(fmt::format("{} cannot be {} here: it stays {}", path, setting.substr(equals + 1),
                                      there ? shownValues(**there) : std::string("unset")));
    }
    for (const std::string& section : setup.unknownSections(options.file)) {
      console.note("Warning: this version does not know section " + section +
                   ", which is left out of the saved file");
    }
    setup = std::move(changed);
  }
  return saveSetup(setup, options.file, console);
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
