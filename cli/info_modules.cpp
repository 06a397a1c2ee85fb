#include "cli/info_modules.h"

#include <fmt/format.h>
#include <fmt/ranges.h>

#include <algorithm>

#include "basic/module_selection.h"
#include "cli/info_topics.h"
#include "platform/units/units.h"

namespace gridbay::cli {

Json quantity(double value, int itemCode) {
  const QunUnit* unit = qunBaseUnit(itemCode);
  return {{"value", plain<float>(value)}, {"unit", unit == nullptr ? "" : unit->symbol}};
}
std::string wordsOfQuantity(const Json& value) {
  const auto unit = value["unit"].get<std::string>();
  return fmt::format("{:g}{}{}", value["value"].get<double>(), unit.empty() || unit == "°" ? "" : " ", unit);
}

Json dataFile(const UTsbSelection& selection) {
  return {{"file", selection.fileName.text()}, {"items", selection.items}};
}
std::string wordsOfFile(const Json& from) {
  const auto items = from["items"].get<std::vector<int>>();
  const auto file = from["file"].get<std::string>();
  return fmt::format("{}, item{} {}", file.empty() ? "a file that is not named" : file,
                     items.size() == 1 ? "" : "s", fmt::join(items, ", "));
}

const ModuleTopics& topicsOf(std::int32_t moduleCode) {
  static constexpr ModuleTopics kNone;
  static constexpr ModuleTopics kModules[] = {
      {module::kAdvectionDispersion, "advection_dispersion", "hydrodynamics and advection-dispersion",
       advectionDispersionTopics},
      {module::kMudTransport, "mud_transport", "hydrodynamics and mud transport", mudTransportTopics},
      {module::kMudTransportExpanded, "mud_transport_expanded", "hydrodynamics and expanded mud transport",
       expandedMudTopics},
      {module::kEcological, "ecology", "hydrodynamics and the ecological model", ecologyTopics},
  };
  const auto* found = std::ranges::find(kModules, moduleCode, &ModuleTopics::code);
  return found == std::end(kModules) ? kNone : *found;
}

Json describeModule(CGlobalKvs& model) {
  Json report = Json::object();
  const ModuleTopics& module = topicsOf(model.moduleSelection->simulationType);
  if (module.topics == nullptr) return report;
  for (const Topic& topic : module.topics()) report[topic.key] = topic.describe(model);
  return report;
}

void printModule(std::int32_t moduleCode, const Json& report, const Line& line) {
  const ModuleTopics& module = topicsOf(moduleCode);
  if (module.topics == nullptr) return;
  for (const Topic& topic : module.topics()) topic.print(report[topic.key], line);
}

Json describeHydrodynamics(CGlobalKvs& model) {
  Json report = Json::object();
  for (const auto& topics : {waterTopics(), conditionTopics(), structureTopics()}) {
    for (const Topic& topic : topics) report[topic.key] = topic.describe(model);
  }
  return report;
}

void printHydrodynamics(const Json& report, const Line& line) {
  for (const auto& topics : {waterTopics(), conditionTopics(), structureTopics()}) {
    for (const Topic& topic : topics) topic.print(report[topic.key], line);
  }
}

}  // namespace gridbay::cli
