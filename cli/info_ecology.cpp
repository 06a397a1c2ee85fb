#include "basic/mass_budget.h"
#include "cli/info_families.h"
#include "ecology/boundary.h"
#include "ecology/constants.h"
#include "ecology/dispersion.h"
#include "ecology/forcings.h"
#include "ecology/initial_conditions.h"
#include "ecology/mass_budget.h"
#include "ecology/model_definition.h"
#include "ecology/results.h"
#include "ecology/source_sink.h"
#include "ecology/starting_conditions.h"

// What the ecological model is set up with.

namespace gridbay::cli {
namespace {

Json describeDefinition(CGlobalKvs& model) {
  const CWQSModelDefinitionKvs& definition = *model.wqsModelDefinition;
  Json symbols = Json::array();
  for (const CSolverItem& variable : definition.stateVariables()) symbols.push_back(variable.symbol);
  return {{"file", definition.modelFile.text()},        {"state_variables", symbols},
          {"constants", definition.constants().size()}, {"forcings", definition.forcings().size()},
          {"processes", definition.processes().size()}, {"processes_disabled", definition.disableProcesses},
          {"update_frequency", definition.frequency}};
}
void printDefinition(const Json& report, const Line& line) {
  const auto file = report["file"].get<std::string>();
  line("Model definition",
       fmt::format("{}: {} state variables, {} constants, {} forcings, {} processes{}",
                   file.empty() ? "no file" : file, report["state_variables"].size(),
                   report["constants"].get<int>(), report["forcings"].get<int>(),
                   report["processes"].get<int>(),
                   report["processes_disabled"].get<bool>() ? ", which are disabled" : ""));
}

Json describeEcologyStart(CGlobalKvs& model) {
  return describeBeginning(*model.wqsStartingConditions, [&model] {
    return describeEntryAreas<WqsVariables>(*model.wqsInitialConditions);
  });
}

// Of a value in the unit of its declaration; nothing for one that is built in.
template <class Item>
Json describeGiven(Item& given) {
  const CSolverItem* declared = given.Declaration();
  Json report{{"symbol", declared == nullptr ? "" : declared->symbol}};
  if (!given.IsUserSpecified()) {
    report["given_as"] = "built in";
  } else if (given.IsConstant()) {
    report["given_as"] = "constant";
    report["value"] = given.value;
    report["unit"] = declared->unit;
  } else if constexpr (requires { given.files; }) {
    report["given_as"] = "maps";
    report["files"] = Json::array();
    for (const UTsbSelection& file : given.files) report["files"].push_back(dataFile(file));
  } else {
    report["given_as"] = given.format == Item::kMap ? "maps" : "time series";
    report["files"] = Json::array({dataFile(given.file)});
  }
  return report;
}
template <auto list>
Json describeAllGiven(CGlobalKvs& model) {
  Json report = Json::array();
  for (int number = 1; number <= (model.*list)->GetCount(); ++number)
    report.push_back(describeGiven((model.*list)->at(number)));
  return report;
}
void printGiven(std::string_view label, const Json& report, const Line& line) {
  for (const Json& given : report) {
    std::string text = given["given_as"].get<std::string>();
    if (given.contains("value"))
      text = fmt::format("{:g} {}", given["value"].get<double>(), given["unit"].get<std::string>());
    if (given.contains("files")) {
      for (const Json& file : given["files"]) text += fmt::format(", {}", wordsOfFile(file));
    }
    line(label, fmt::format("{}: {}", given["symbol"].get<std::string>(), text));
  }
}
void printConstants(const Json& report, const Line& line) {
  printGiven("Constant", report, line);
}
void printForcings(const Json& report, const Line& line) {
  printGiven("Forcing", report, line);
}

Json describeEcologyBudgets(CGlobalKvs& model) {
  return model.massBudget->GetCount() > 0 ? describeMassFiles(*model.wqsMassBudget) : Json::array();
}

constexpr Topic kEcologyTopics[] = {
    {"definition", describeDefinition, printDefinition},
    {"initially", describeEcologyStart, printBeginning},
    {"constants", describeAllGiven<&CGlobalKvs::wqsConstants>, printConstants},
    {"forcings", describeAllGiven<&CGlobalKvs::wqsForcings>, printForcings},
    {"dispersion", dispersionTopic<&CGlobalKvs::wqsAdDispersion>, printDispersion},
    {"boundaries", boundaryTopic<&CGlobalKvs::wqsAdBoundary, WqsVariables>, printBoundaryValues},
    {"sources", sourceTopic<&CGlobalKvs::wqsAdSourceSink, WqsVariables>, printSourceValues},
    {"mass_budgets", describeEcologyBudgets, printMassFiles},
    {"outputs", outputTopic<&CGlobalKvs::wqsResults>, printTransportOutputs},
};

}  // namespace

std::span<const Topic> ecologyTopics() {
  return kEcologyTopics;
}

}  // namespace gridbay::cli
