#include <fmt/ranges.h>

#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "cli/info_families.h"
#include "mud_transport_expanded/bed_density.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/dispersion_coef.h"
#include "mud_transport_expanded/dredgings.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/mass_budget.h"
#include "mud_transport_expanded/morphology.h"
#include "mud_transport_expanded/result.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/starting_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/wave_database.h"
#include "mud_transport_expanded/waves.h"

// What expanded mud transport is set up with.

namespace gridbay::cli {
namespace {

Json describeCounts(CGlobalKvs& model) {
  const CNmtExpTaskSelectionKvs& task = *model.nmtExpTaskSelection;
  return {{"fractions", task.fractions},
          {"layers", task.layers},
          {"salinity", task.includeSalinity},
          {"xenobiotics", task.includeXenobiotics}};
}
void printCounts(const Json& report, const Line& line) {
  line("Mud", fmt::format("{} fraction{} over {} layer{}{}", report["fractions"].get<int>(),
                          report["fractions"] == 1 ? "" : "s", report["layers"].get<int>(),
                          report["layers"] == 1 ? "" : "s",
                          report["salinity"].get<bool>() ? ", with salinity" : ""));
}

Json describeExpandedMudStart(CGlobalKvs& model) {
  CNmtExpInitialConditionsKvs& initial = *model.nmtExpInitialConditions;
  return describeBeginning(*model.nmtExpStartingConditions, [&] {
    Json report = Json::array();
    for (int entry = 1; entry <= initial.components.GetCount(); ++entry) {
      report.push_back({{"name", ExpandedMudEntries::name(model, entry)},
                        {"areas", describeAreas(initial.components.at(entry),
                                                ExpandedMudEntries::quantity(model, entry))}});
    }
    return report;
  });
}

// The layers of the bed: how thick and how dense they are, and what part each fraction has in them.
Json describeExpandedMudBed(CGlobalKvs& model) {
  CNmtExpInitialConditionsKvs& initial = *model.nmtExpInitialConditions;
  Json report = Json::array();
  for (int layer = 1; layer <= initial.thicknesses.GetCount(); ++layer) {
    auto& thickness = initial.thicknesses.at(layer);
    Json areas = Json::array();
    for (int area = 1; area <= thickness.GetCount(); ++area) {
      const auto& given = thickness.given(area);
      Json at{{"area", area}};
      if (given.format == std::remove_cvref_t<decltype(given)>::kConstant) {
        at["value"] = quantity(given.value, item::kLayerThickness);
      } else {
        at.update(dataFile(thickness.at(area).file));
      }
      areas.push_back(std::move(at));
    }
    report.push_back({{"thickness", std::move(areas)},
                      {"density", describeAreas(model.nmtExpBedDensity->at(layer), item::kBedDensity)},
                      {"percentages", initial.distribution.at(layer).percentages}});
  }
  return report;
}
void printExpandedMudBed(const Json& report, const Line& line) {
  int layer = 0;
  for (const Json& of : report) {
    line(
        fmt::format("Bed layer {}", ++layer),
        fmt::format("thick {}; dense {}; fractions {} %", wordsOfAreas(of["thickness"]),
                    wordsOfAreas(of["density"]), fmt::join(of["percentages"].get<std::vector<int>>(), ", ")));
  }
}

Json describeExpandedMudWaves(CGlobalKvs& model) {
  using Waves = CNmtExpWavesKvs;
  if (model.nmtExpForcings->includeWaves == 0) return {{"given_as", "none"}};
  switch (model.nmtExpWaves->typeOfWaveVariation) {
    case Waves::kVarying: {
      Json report{{"given_as", "maps"}};
      report.update(dataFile(model.nmtExpTsvWaves->file));
      return report;
    }
    case Waves::kDatabase:
      return {{"given_as", "database"}, {"maps", model.nmtExpWaveDatabase->maps.GetCount()}};
    default:
      return {{"given_as", "constant"},
              {"height", quantity(model.nmtExpConstantWaves->height, item::kWaveHeight)},
              {"period", quantity(model.nmtExpConstantWaves->period, item::kWavePeriod)},
              {"direction", quantity(model.nmtExpConstantWaves->direction, item::kMeanWaveDirection)}};
  }
}

Json describeDredging(CGlobalKvs& model) {
  Json report = Json::array();
  for (int number = 1;
       model.nmtExpForcings->includeDredging != 0 && number <= model.nmtExpDredgings->GetCount(); ++number)
    report.push_back(dataFile(model.nmtExpDredgings->at(number).file));
  return report;
}
void printDredging(const Json& report, const Line& line) {
  int number = 0;
  for (const Json& dredger : report)
    line(fmt::format("Dredger {}", ++number), "as in " + wordsOfFile(dredger));
}

Json describeMorphology(CGlobalKvs& model) {
  const CNmtExpMorphologyKvs& morphology = *model.nmtExpMorphology;
  const bool isFaster = morphology.includeSpeedupFactor != 0;
  return {{"included", morphology.includeMorphology != 0},
          {"speed_up", isFaster ? plain<float>(morphology.speedupFactor) : 1.0}};
}
void printMorphology(const Json& report, const Line& line) {
  if (report["included"].get<bool>())
    line("Morphology",
         fmt::format("the bed changes the flow, {:g} times as fast", report["speed_up"].get<double>()));
}

Json describeExpandedMudBudgets(CGlobalKvs& model) {
  return model.massBudget->GetCount() > 0 ? describeMassFiles(*model.nmtExpMassBudget) : Json::array();
}

constexpr Topic kExpandedMudTopics[] = {
    {"counts", describeCounts, printCounts},
    {"initially", describeExpandedMudStart, printBeginning},
    {"bed", describeExpandedMudBed, printExpandedMudBed},
    {"dispersion", dispersionTopic<&CGlobalKvs::nmtExpDispersionCoef>, printDispersion},
    {"boundaries", boundaryTopic<&CGlobalKvs::nmtExpBoundary, ExpandedMudEntries>, printBoundaryValues},
    {"sources", sourceTopic<&CGlobalKvs::nmtExpSources, ExpandedMudEntries>, printSourceValues},
    {"waves", describeExpandedMudWaves, printWaves},
    {"dredging", describeDredging, printDredging},
    {"morphology", describeMorphology, printMorphology},
    {"lines", placesTopic<&CGlobalKvs::nmtExpLineDischarge>, printLines},
    {"mass_budgets", describeExpandedMudBudgets, printMassFiles},
    {"outputs", outputTopic<&CGlobalKvs::nmtExpResult>, printTransportOutputs},
};

}  // namespace

std::span<const Topic> expandedMudTopics() {
  return kExpandedMudTopics;
}

}  // namespace gridbay::cli
