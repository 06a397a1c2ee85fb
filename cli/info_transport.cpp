#include "advection_dispersion/boundary.h"
#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/decay_specification.h"
#include "advection_dispersion/deposition_concentration.h"
#include "advection_dispersion/dispersion_coef.h"
#include "advection_dispersion/evaporation.h"
#include "advection_dispersion/feedback.h"
#include "advection_dispersion/heat_dissipation.h"
#include "advection_dispersion/infiltration.h"
#include "advection_dispersion/initial_concentration.h"
#include "advection_dispersion/line_discharge.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/precipitation.h"
#include "advection_dispersion/result.h"
#include "advection_dispersion/source_sink.h"
#include "advection_dispersion/starting_conditions.h"
#include "basic/module_selection.h"
#include "cli/info_families.h"

// What advection-dispersion is set up with.

namespace gridbay::cli {
namespace {

constexpr int kPlainNumber = 0;

// A coefficient of the component of its number, constant or in time.
template <class Coefficients>
Json coefficientOf(Coefficients& coefficients, int number, int itemCode) {
  auto* held = coefficients.GetItem(number);
  if (held == nullptr) return Json::object();
  if (held->format == std::remove_pointer_t<decltype(held)>::kTimeSeries) return dataFile(held->file);
  return {{"value", quantity(held->value, itemCode)}};
}

Json describeComponents(CGlobalKvs& model) {
  using Component = CNadComponentObjectKvs;
  Json report = Json::array();
  for (int number = 1; number <= model.nadComponent->GetCount(); ++number) {
    const Component& component = model.nadComponent->at(number);
    Json entry{{"name", component.name}};
    switch (component.type) {
      case Component::kDecaying:
        entry["type"] = "decaying";
        entry["rate"] = coefficientOf(*model.nadDecaySpecification, number, item::kDecayCoefficient);
        break;
      case Component::kHeatDissipating:
        entry["type"] = "heat dissipating";
        entry["rate"] = coefficientOf(*model.nadHeatDissipation, number, kPlainNumber);
        break;
      case Component::kHeatExchange:
        entry["type"] = "heat exchange";
        break;
      case Component::kConservative:
        entry["type"] = "conservative";
        break;
      default:
        entry["type"] = fmt::format("type {}, which is none", component.type);
    }
    report.push_back(std::move(entry));
  }
  return report;
}
void printComponents(const Json& report, const Line& line) {
  int number = 0;
  for (const Json& component : report) {
    std::string text =
        fmt::format("{}, {}", component["name"].get<std::string>(), component["type"].get<std::string>());
    if (component.contains("rate")) {
      const Json& rate = component["rate"];
      if (rate.contains("file")) text += " as in " + wordsOfFile(rate);
      if (rate.contains("value")) text += fmt::format(" at {}", wordsOfQuantity(rate["value"]));
    }
    line(fmt::format("Component {}", ++number), text);
  }
}

Json describeFeedback(CGlobalKvs& model) {
  return model.nadFeedback->isIncluded;
}
void printFeedback(const Json& report, const Line& line) {
  if (report.get<bool>()) line("Feedback", "salinity and temperature change the density of the water");
}

Json describeTransportStart(CGlobalKvs& model) {
  return describeBeginning(*model.nadStartingConditions, [&model] {
    return describeEntryAreas<AdComponents>(*model.nadInitialConcentration);
  });
}

// What comes with water that does not come or go is not told.
template <auto member>
Json describeWater(CGlobalKvs& model) {
  auto& values = *(model.*member);
  return values.Applies() ? describeSurfaceValues<AdComponents>(values) : Json(nullptr);
}
template <const char* const& label>
void printWater(const Json& report, const Line& line) {
  if (!report.is_null()) line(label, wordsOfConcentrations(report));
}
constexpr const char* kInRain = "In the rain";
constexpr const char* kInVapour = "Evaporating";
constexpr const char* kInGround = "Infiltrating";

Json describeDeposition(CGlobalKvs& model) {
  CNadDepositionConcentrationKvs& deposition = *model.nadDepositionConcentration;
  const auto describe = [&model](auto& entries) {
    Json report = Json::array();
    for (int number = 1; number <= entries.GetCount(); ++number) {
      report.push_back({{"name", AdComponents::name(model, number)},
                        {"areas", describeAreas(entries.at(number), item::kDepositionRate)}});
    }
    return report;
  };
  return {{"surface", deposition.includeSurface ? describe(deposition.surface) : Json(nullptr)},
          {"soil", deposition.includeSoil ? describe(deposition.soil) : Json(nullptr)}};
}
void printDeposition(const Json& report, const Line& line) {
  if (!report["surface"].is_null()) printEntryAreas("Onto the water", report["surface"], line);
  if (!report["soil"].is_null()) printEntryAreas("From the soil", report["soil"], line);
}

Json describeTransportBudgets(CGlobalKvs& model) {
  return model.moduleSelection->HasMassBudget() ? describeMassFiles(*model.nadMassBudget) : Json::array();
}
constexpr Topic kTransportTopics[] = {
    {"components", describeComponents, printComponents},
    {"feedback", describeFeedback, printFeedback},
    {"initially", describeTransportStart, printBeginning},
    {"dispersion", dispersionTopic<&CGlobalKvs::nadDispersionCoef>, printDispersion},
    {"boundaries", boundaryTopic<&CGlobalKvs::nadBoundary, AdComponents>, printBoundaryValues},
    {"sources", sourceTopic<&CGlobalKvs::nadSourceSink, AdComponents>, printSourceValues},
    {"precipitation", describeWater<&CGlobalKvs::nadPrecipitation>, printWater<kInRain>},
    {"evaporation", describeWater<&CGlobalKvs::nadEvaporation>, printWater<kInVapour>},
    {"infiltration", describeWater<&CGlobalKvs::nadInfiltration>, printWater<kInGround>},
    {"deposition", describeDeposition, printDeposition},
    {"lines", placesTopic<&CGlobalKvs::nadLineDischarge>, printLines},
    {"boxes", placesTopic<&CGlobalKvs::nadBoxSummation>, printBoxes},
    {"mass_budgets", describeTransportBudgets, printMassFiles},
    {"outputs", outputTopic<&CGlobalKvs::nadResult>, printTransportOutputs},
};

}  // namespace

std::span<const Topic> advectionDispersionTopics() {
  return kTransportTopics;
}

}  // namespace gridbay::cli
