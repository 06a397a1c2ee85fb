#include <fmt/format.h>

#include "cli/info_families.h"
#include "cli/info_topics.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wind_conditions.h"
#include "platform/units/units.h"

namespace gridbay::cli {
namespace {

// An entry for each area of a list that follows them.
template <class List, class Describe>
Json byArea(List& list, const Describe& describe) {
  Json report = Json::array();
  for (int number = 1; number <= list.GetCount(); ++number) {
    Json entry{{"area", number}};
    entry.update(describe(list.at(number)));
    report.push_back(std::move(entry));
  }
  return report;
}
Json describeBoundaries(CGlobalKvs& model) {
  using Condition = CNhdBoundaryObjectKvs;
  Json report = Json::array();
  for (int number = 1; number <= model.nhdBoundary->GetCount(); ++number) {
    const Condition& condition = model.nhdBoundary->at(number);
    Json entry{{"number", number}, {"drives", condition.formulation == Condition::kFlux ? "flux" : "level"}};
    if (condition.isFromFile()) {
      entry.update(dataFile(condition.dataFile));
    } else if (condition.dataFormat == Condition::kSineSeries) {
      entry["range"] = quantity(condition.range, condition.quantity());
      entry["mean"] = quantity(condition.referenceLevel, condition.quantity());
      entry["period"] = quantity(condition.period, item::kTimeStep);
    } else {
      entry["value"] = quantity(condition.value, condition.quantity());
    }
    report.push_back(std::move(entry));
  }
  return report;
}
void printBoundaries(const Json& report, const Line& line) {
  for (const Json& boundary : report) {
    std::string text = boundary["drives"].get<std::string>();
    if (boundary.contains("file")) {
      text += " from " + wordsOfFile(boundary);
    } else if (boundary.contains("value")) {
      text += ", " + wordsOfQuantity(boundary["value"]);
    } else {
      text += fmt::format(", a sine of range {} about {}, period {}", wordsOfQuantity(boundary["range"]),
                          wordsOfQuantity(boundary["mean"]), wordsOfQuantity(boundary["period"]));
    }
    line(fmt::format("At boundary {}", boundary["number"].get<int>()), text);
  }
}

Json describeSurfaceElevation(CGlobalKvs& model) {
  using Entry = CNhdSurfaceElevationObjectKvs;
  return byArea(*model.nhdSurfaceElevation, [](const Entry& entry) {
    return entry.type == Entry::kFromFile
               ? dataFile(entry.map)
               : Json{{"value", quantity(entry.constantValue, item::kSurfaceElevation)}};
  });
}
void printSurfaceElevation(const Json& report, const Line& line) {
  line("Initial level", wordsOfAreas(report));
}

Json describeWind(CGlobalKvs& model) {
  const CWindConditionsKvs& wind = *model.windConditions;
  switch (wind.dataFormat) {
    case CWindConditionsKvs::kConstant:
      return {{"given_as", "constant"},
              {"speed", quantity(wind.constantSpeed, item::kWindSpeed)},
              {"direction", quantity(wind.constantDirection, item::kWindDirection)}};
    case CWindConditionsKvs::kConstantInSpace:
    case CWindConditionsKvs::kVarying: {
      Json report{{"given_as", wind.dataFormat == CWindConditionsKvs::kVarying ? "maps" : "time series"}};
      report.update(dataFile(wind.windFile));
      return report;
    }
    default:
      return {{"given_as", "none"}};
  }
}
void printWind(const Json& report, const Line& line) {
  const auto kind = report["given_as"].get<std::string>();
  if (report.contains("file")) {
    line("Wind", fmt::format("{} in {}", kind, wordsOfFile(report)));
  } else if (report.contains("speed")) {
    line("Wind",
         fmt::format("{} from {}", wordsOfQuantity(report["speed"]), wordsOfQuantity(report["direction"])));
  } else {
    line("Wind", kind);
  }
}

Json describeViscosity(CGlobalKvs& model) {
  using Entry = CNhdEddyViscosityObjectKvs;
  CNhdEddyViscosityKvs& viscosity = *model.nhdEddyViscosity;
  const auto areas = [&viscosity](const auto& describe) { return byArea(viscosity, describe); };
  switch (viscosity.dataFormat) {
    case CNhdEddyViscosityKvs::kConstant:
      return {{"type", "constant"},
              {"areas", areas([](const Entry& entry) {
                 return Json{{"value", quantity(entry.constantValue, item::kEddyViscosity)}};
               })}};
    case CNhdEddyViscosityKvs::kFromFile:
      return {{"type", "maps"}, {"areas", areas([](const Entry& entry) { return dataFile(entry.map); })}};
    case CNhdEddyViscosityKvs::kSmagorinsky:
      return {{"type", "Smagorinsky formula"},
              {"areas", areas([](const Entry& entry) {
                 return Json{{"value", quantity(entry.smagorinskyConstant, 0)}};
               })}};
    default:
      return {{"type", "none"}};
  }
}
void printViscosity(const Json& report, const Line& line) {
  std::string text = report["type"].get<std::string>();
  if (report.contains("areas")) text += ", " + wordsOfAreas(report["areas"]);
  line("Eddy viscosity", text);
}

Json describeResistance(CGlobalKvs& model) {
  using Entry = CNhdResistanceObjectKvs;
  const bool isChezy = model.nhdResistance->formulation == CNhdResistanceKvs::kChezy;
  const int number = isChezy ? item::kChezyNumber : item::kManningNumber;
  const auto describe = [number](const Entry& entry) -> Json {
    if (entry.dataFormat == Entry::kDataFile) return dataFile(entry.map);
    if (entry.dataFormat != Entry::kConstant) return Json::object();
    return {{"value", quantity(entry.constantValue, number)}};
  };
  const bool byWaves = model.nhdResistance->formulation == CNhdResistanceKvs::kWaveInduced;
  return {{"number", isChezy ? "Chezy" : "Manning"},
          {"wave_induced", byWaves},
          {"areas", byArea(*model.nhdResistance, describe)}};
}
void printResistance(const Json& report, const Line& line) {
  line("Resistance",
       fmt::format("{} number, {}{}", report["number"].get<std::string>(), wordsOfAreas(report["areas"]),
                   report["wave_induced"].get<bool>() ? "; induced by waves" : ""));
}

constexpr Topic kConditionTopics[] = {
    {"boundaries", describeBoundaries, printBoundaries},
    {"initial_level", describeSurfaceElevation, printSurfaceElevation},
    {"wind", describeWind, printWind},
    {"eddy_viscosity", describeViscosity, printViscosity},
    {"resistance", describeResistance, printResistance},
};

}  // namespace

std::span<const Topic> conditionTopics() {
  return kConditionTopics;
}

}  // namespace gridbay::cli
