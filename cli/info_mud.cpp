#include "cli/info_families.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/dispersion_coef.h"
#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/erosion_for_each_layer.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/result.h"
#include "mud_transport/settling_and_desposition.h"
#include "mud_transport/sliding.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/starting_conditions.h"
#include "mud_transport/task_selection.h"
#include "mud_transport/wave_data.h"

// What mud transport is set up with, in either task.

namespace gridbay::cli {
namespace {

Json describeTask(CGlobalKvs& model) {
  const CNmtTaskSelectionKvs& task = *model.nmtTaskSelection;
  return {{"task", task.multiFraction ? "multi fraction" : "multi layer"},
          {"fractions", task.fractions},
          {"layers", task.layers},
          {"salinity", task.includeSalinity}};
}
void printTask(const Json& report, const Line& line) {
  line("Mud", fmt::format("{} task: {} fraction{} over {} layer{}{}", report["task"].get<std::string>(),
                          report["fractions"].get<int>(), report["fractions"] == 1 ? "" : "s",
                          report["layers"].get<int>(), report["layers"] == 1 ? "" : "s",
                          report["salinity"].get<bool>() ? ", with salinity" : ""));
}

// Of a layer's thickness the format and the constant of area 1 hold for all areas.
Json describeMudStart(CGlobalKvs& model) {
  return describeBeginning(*model.nmtStartingConditions, [&model] {
    const CNmtTaskSelectionKvs& task = *model.nmtTaskSelection;
    Json report = Json::array();
    for (int entry = 1; entry <= model.nmtInitialConcentration->GetCount(); ++entry) {
      CNmtInitialComponentKvs& values = model.nmtInitialConcentration->at(entry);
      Json areas = Json::array();
      for (int area = 1; area <= values.GetCount(); ++area) {
        const CNmtInitialObjectKvs& given =
            values.at(CNmtInitialComponentKvs::FormatArea(area, task.IsThickness(entry)));
        Json at{{"area", area}};
        if (given.format == CNmtInitialObjectKvs::kConstant) {
          at["value"] = quantity(given.value, task.EntryQuantity(entry));
        } else {
          at.update(dataFile(values.at(area).file));
        }
        areas.push_back(std::move(at));
      }
      report.push_back({{"name", task.EntryName(entry)}, {"areas", std::move(areas)}});
    }
    return report;
  });
}

// How the fractions settle in the one task; how the layers of the bed erode in the other.
Json describeMudBed(CGlobalKvs& model) {
  if (!model.nmtTaskSelection->multiFraction) {
    const bool byFactor = model.nmtMlErosionCharacteristics->useConstantErosionCoefficient != 0;
    Json report{
        {"critical_shear_stress",
         describeConstantsOrMaps(*model.nmtErosionForEachLayerCritical, item::kShearStress)},
        {"density", describeConstantsOrMaps(*model.nmtErosionForEachLayerDensity, item::kBedDensityInGrams)},
        {"slides", model.nmtSliding->includeSliding != 0}};
    if (byFactor)
      report["erosion_factor"] =
          describeConstantsOrMaps(*model.nmtErosionForEachLayerFactor, item::kErosionRateInGrams);
    return report;
  }
  Json settling = Json::array();
  for (int entry = 1; entry <= model.nmtSettlingAndDesposition->GetCount(); ++entry) {
    settling.push_back({{"name", model.nmtTaskSelection->EntryName(entry)},
                        {"velocity", quantity(model.nmtSettlingAndDesposition->at(entry).meanSettlingVelocity,
                                              item::kSettlingVelocity)}});
  }
  return {{"settling", settling}};
}
void printMudBed(const Json& report, const Line& line) {
  if (report.contains("settling")) {
    for (const Json& fraction : report["settling"])
      line("Settling", fmt::format("{} at {}", fraction["name"].get<std::string>(),
                                   wordsOfQuantity(fraction["velocity"])));
    return;
  }
  printConstantsOrMaps("Eroding from", report["critical_shear_stress"], line);
  if (report.contains("erosion_factor")) printConstantsOrMaps("Eroding by", report["erosion_factor"], line);
  printConstantsOrMaps("Density of bed", report["density"], line);
  line("Sliding", report["slides"].get<bool>() ? "the bed slides" : "none");
}

// Only the layers feel waves.
Json describeMudWaves(CGlobalKvs& model) {
  const CNmtWaveDataKvs& waves = *model.nmtWaveData;
  if (model.nmtTaskSelection->multiFraction || waves.description == CNmtWaveDataKvs::kExcluded)
    return {{"given_as", "none"}};
  if (waves.IsFromFile()) {
    Json report{{"given_as", "maps"}};
    report.update(dataFile(waves.file));
    return report;
  }
  return {{"given_as", "constant"},
          {"height", quantity(waves.significantHeight, item::kSignificantWaveHeight)},
          {"period", quantity(waves.significantPeriod, item::kWavePeriod)},
          {"direction", quantity(waves.angleWithTrueNorth, item::kWaveDirection)}};
}

constexpr Topic kMudTopics[] = {
    {"task", describeTask, printTask},
    {"initially", describeMudStart, printBeginning},
    {"dispersion", dispersionTopic<&CGlobalKvs::nmtDispersionCoef>, printDispersion},
    {"boundaries", boundaryTopic<&CGlobalKvs::nmtBoundary, MudFractions>, printBoundaryValues},
    {"sources", sourceTopic<&CGlobalKvs::nmtSourceSink, MudFractions>, printSourceValues},
    {"bed", describeMudBed, printMudBed},
    {"waves", describeMudWaves, printWaves},
    {"lines", placesTopic<&CGlobalKvs::nmtLineDischarge>, printLines},
    {"boxes", placesTopic<&CGlobalKvs::nmtBoxSummation>, printBoxes},
    {"outputs", outputTopic<&CGlobalKvs::nmtResult>, printTransportOutputs},
};

}  // namespace

std::span<const Topic> mudTransportTopics() {
  return kMudTopics;
}

}  // namespace gridbay::cli
