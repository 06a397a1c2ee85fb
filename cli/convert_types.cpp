#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "cli/commands.h"
#include "platform/units/units.h"

namespace gridbay::cli {
namespace {

struct TypesConversionOptions {
  bool json = false;
};

int types(const TypesConversionOptions& options, const Console& console) {
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

void addConvertTypes(CLI::App& convert, Action& action) {
  std::shared_ptr<TypesConversionOptions> options;
  CLI::App& command =
      addCommand(convert, action, "types",
                 "Lists the item types: code, name, and the base unit that values are in", types, options);
  command.add_flag("--json", options->json, "The same as JSON");
}

}  // namespace gridbay::cli
