#include <fmt/format.h>

#include "basic/source_sink.h"
#include "cli/info_topics.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/source_sink.h"
#include "platform/units/units.h"

namespace gridbay::cli {
namespace {

// Rain and evaporation

constexpr std::string_view kConstant = "constant";

Json water(std::int32_t kind, float value, const UTsbSelection& file) {
  if (kind == CNhdSourceSinkKvs::kConstant)
    return {{"given_as", kConstant}, {"rate", quantity(value, item::kRainAndEvaporation)}};
  Json report{{"given_as", kind == CNhdSourceSinkKvs::kMap ? "maps" : "time series"}};
  report.update(dataFile(file));
  return report;
}
std::string wordsOfWater(const Json& report) {
  if (report["given_as"] != kConstant)
    return fmt::format("{} in {}", report["given_as"].get<std::string>(), wordsOfFile(report));
  return report["rate"]["value"] == 0 ? "none" : wordsOfQuantity(report["rate"]);
}

Json describePrecipitation(CGlobalKvs& model) {
  const CNhdSourceSinkKvs& flows = *model.nhdSourceSink;
  Json report = water(flows.precipitationKind, flows.precipitation, flows.precipitationFile);
  report["net"] = flows.netPrecipitation;
  report["on_dry_land"] = flows.rainOnDryLand;
  return report;
}
void printPrecipitation(const Json& report, const Line& line) {
  std::string text = wordsOfWater(report);
  if (text != "none") {
    if (report["net"].get<bool>()) text += ", less evaporation";
    text += report["on_dry_land"].get<bool>() ? ", on dry land too" : ", not on dry land";
  }
  line("Rain", text);
}

Json describeEvaporation(CGlobalKvs& model) {
  const CNhdSourceSinkKvs& flows = *model.nhdSourceSink;
  if (flows.netPrecipitation && flows.HasPrecipitation()) return {{"given_as", "part of net precipitation"}};
  return water(flows.evaporationKind, flows.evaporation, flows.evaporationFile);
}
void printEvaporation(const Json& report, const Line& line) {
  const bool isInRain = !report.contains("rate") && !report.contains("file");
  line("Evaporation", isInRain ? "in the rain already" : wordsOfWater(report));
}

// Sources and sinks

Json describeSources(CGlobalKvs& model) {
  Json report = Json::array();
  for (int number = 1; number <= model.nhdSourceSink->GetCount(); ++number) {
    CNhdSourceSinkObjectKvs& flow = *model.nhdSourceSink->GetItem(number);
    const bool hasVelocity = flow.NoItems(number) > 1;
    Json entry{{"number", number}, {"location", model.sourceSink->at(number).Text()}};
    if (flow.dataFormat == CNhdSourceSinkObjectKvs::kFromFile) {
      entry["given_as"] = "time series";
      entry.update(dataFile(flow.dataFile));
      entry["item_names"] = Json::array({flow.itemMagnitude});
      if (hasVelocity) entry["item_names"].push_back(flow.itemVelocity);
    } else {
      entry["given_as"] = kConstant;
      entry["discharge"] = quantity(flow.constantMagnitude, item::kDischarge);
      if (hasVelocity) entry["velocity"] = quantity(flow.constantVelocity, item::kFlowVelocity);
    }
    if (hasVelocity) entry["direction"] = quantity(flow.outletDirection, item::kFlowDirection);
    report.push_back(std::move(entry));
  }
  return report;
}
void printSources(const Json& report, const Line& line) {
  for (const Json& source : report) {
    std::string text;
    if (source["given_as"] == kConstant) {
      text = wordsOfQuantity(source["discharge"]);
      if (source.contains("velocity")) text += " at " + wordsOfQuantity(source["velocity"]);
    } else {
      text = "time series in " + wordsOfFile(source);
    }
    if (source.contains("direction")) text += " towards " + wordsOfQuantity(source["direction"]);
    line(fmt::format("Source {}", source["number"].get<int>()),
         fmt::format("{}  {}", source["location"].get<std::string>(), text));
  }
}

// Infiltration

Json describeInfiltration(CGlobalKvs& model) {
  const CNhdInfiltrationKvs& object = *model.nhdInfiltration;
  if (object.File() == nullptr) return {{"type", "none"}};
  Json report;
  if (object.infiltrationType == CNhdInfiltrationKvs::kNetRate) {
    const bool varies = object.infiltrationFormat == CNhdInfiltrationKvs::kVaryingInTime;
    report = {{"type", "net rate"}, {"varies_in_time", varies}};
  } else {
    const bool isLevel = object.groundwaterDepthType == CNhdInfiltrationKvs::kLevel;
    const bool isContent = object.initialVolumeType == CNhdInfiltrationKvs::kWaterContent;
    report = {{"type", "constant rate with capacity"},
              {"groundwater", isLevel ? "level" : "depth below ground"},
              {"initial_volume", isContent ? "water content" : "percentage of the capacity"}};
  }
  report.update(dataFile(*object.File()));
  return report;
}
void printInfiltration(const Json& report, const Line& line) {
  std::string text = report["type"].get<std::string>();
  if (report.contains("varies_in_time"))
    text += report["varies_in_time"].get<bool>() ? ", varying in time" : ", constant in time";
  if (report.contains("file")) text += ", maps in " + wordsOfFile(report);
  if (report.contains("groundwater")) {
    text +=
        fmt::format("; groundwater by its {}, initial volume by its {}",
                    report["groundwater"].get<std::string>(), report["initial_volume"].get<std::string>());
  }
  line("Infiltration", text);
}

constexpr Topic kWaterTopics[] = {
    {"precipitation", describePrecipitation, printPrecipitation},
    {"evaporation", describeEvaporation, printEvaporation},
    {"sources", describeSources, printSources},
    {"infiltration", describeInfiltration, printInfiltration},
};

}  // namespace

std::span<const Topic> waterTopics() {
  return kWaterTopics;
}

}  // namespace gridbay::cli
