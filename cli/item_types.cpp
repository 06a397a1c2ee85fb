#include "cli/item_types.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <vector>

#include "cli/commands.h"
#include "core/nearest.h"
#include "core/number_text.h"

namespace gridbay::cli {
namespace {

struct Options {
  bool json = false;
};

int types(const Options& options, const Console& console) {
  nlohmann::ordered_json list = nlohmann::ordered_json::array();
  for (const QunItem& quantity : qunItems()) {
    const QunUnit& unit = *qunBaseUnit(quantity.code);
    if (options.json) {
      list.push_back({{"code", quantity.code}, {"name", quantity.name}, {"unit", unit.symbol}});
    } else {
      console.out << fmt::format("{:>6}  {:<34}  {}\n", quantity.code, quantity.name, unit.symbol);
    }
  }
  if (options.json) console.out << list.dump(2) << '\n';
  return kClean;
}

}  // namespace

Result<const QunItem*> itemTypeOfText(std::string_view text) {
  const std::string where = fmt::format("\"{} convert types\" lists them", toolName());
  if (!text.empty() && text.find_first_not_of("0123456789") == text.npos) {
    const QunItem* byCode = qunFindItem(int32OfText(text).value_or(0));
    if (byCode != nullptr) return byCode;
    return Failure{fmt::format("There is no item type {}; {}", text, where)};
  }
  const std::string wanted = lowered(text);
  std::vector<std::string_view> names;
  std::vector<const QunItem*> beginSo;
  for (const QunItem& quantity : qunItems()) {
    const std::string name = lowered(quantity.name);
    if (name == wanted) return &quantity;
    if (name.starts_with(wanted)) beginSo.push_back(&quantity);
    names.push_back(quantity.name);
  }
  if (beginSo.size() == 1) return beginSo.front();
  if (!wanted.empty() && !beginSo.empty()) {
    std::string list;
    for (const QunItem* quantity : beginSo)
      list += fmt::format("{}\"{}\"", list.empty() ? "" : ", ", quantity->name);
    return Failure{fmt::format("Several item types begin with \"{}\": {}", text, list)};
  }
  const std::string_view nearest = nearestOf(text, names);
  return Failure{fmt::format("There is no item type \"{}\"; {}{}", text,
                             nearest.empty() ? "" : fmt::format("did you mean \"{}\"? ", nearest), where)};
}

void addConvertTypes(CLI::App& convert, Action& action) {
  std::shared_ptr<Options> options;
  CLI::App& command =
      addCommand(convert, action, "types",
                 "Lists the item types: code, name, and the base unit that values are in", types, options);
  command.add_flag("--json", options->json, "The same as JSON");
}

}  // namespace gridbay::cli
