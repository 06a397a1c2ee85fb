#pragma once

#include <fmt/format.h>

#include "cli/info_topics.h"
#include "families/boundary_values.h"
#include "families/line_box.h"
#include "families/mass_budget.h"
#include "families/source_values.h"
#include "families/surface_values.h"
#include "families/transport_results.h"
#include "platform/units/units.h"

// What modules of transport have in common, described and told once: `Module` is what a module carries with
// the water (families/entry_constants.h).

namespace gridbay::cli {

// A data file by its name alone, where its items are those of what is carried.
Json dataFile(const FileNameValue& file);

// The constant of each entry, or the file that gives them.
template <class Module, class Values, class QuantityOf>
Json describeConcentrations(CKvsBase& object, Values& values, std::string_view fileKind,
                            const QuantityOf& quantityOf) {
  if (!fileKind.empty()) {
    Json report{{"given_as", fileKind}};
    report.update(dataFile(values.file));
    return report;
  }
  Json report{{"given_as", "constant"}, {"values", Json::array()}};
  for (int entry = 1; entry <= static_cast<int>(values.constants.size()); ++entry) {
    Json value = quantity(static_cast<double>(*values.Constant(entry)), quantityOf(entry));
    value["name"] = Module::name(object, entry);
    report["values"].push_back(std::move(value));
  }
  return report;
}

template <class Module, class List>
Json describeBoundaryValues(List& list) {
  Json report = Json::array();
  for (int number = 1; number <= list.GetCount(); ++number) {
    auto& values = list.at(number);
    using Values = std::remove_reference_t<decltype(values)>;
    const std::string_view kind = values.format == Values::kTimeSeries ? "time series"
                                  : values.format == Values::kProfile  ? "profile"
                                                                       : "";
    report.push_back(describeConcentrations<Module>(
        list, values, kind, [&list](int entry) { return Module::quantity(list, entry); }));
  }
  return report;
}

template <class Module, class List>
Json describeSourceValues(List& list) {
  Json report = Json::array();
  for (int number = 1; number <= list.GetCount(); ++number) {
    auto& values = list.at(number);
    using Values = std::remove_reference_t<decltype(values)>;
    report.push_back(describeConcentrations<Module>(
        list, values, values.format == Values::kTimeSeries ? "time series" : "",
        [&list, number](int entry) { return Module::sourceQuantity(list, entry, number); }));
  }
  return report;
}

template <class Module, class Values>
Json describeSurfaceValues(Values& values) {
  if (values.format == Values::kFromAmbientWater) return {{"given_as", "as in the water around"}};
  const std::string_view kind = values.format == Values::kTimeSeries ? "time series"
                                : values.format == Values::kMap      ? "maps"
                                                                     : "";
  return describeConcentrations<Module>(values, values, kind,
                                        [&values](int entry) { return Module::quantity(values, entry); });
}

// An entry for each area of what has a format, a value and a file there.
template <class Areas>
Json describeAreas(Areas& areas, int itemCode) {
  Json report = Json::array();
  for (int number = 1; number <= areas.GetCount(); ++number) {
    auto& value = areas.at(number);
    Json entry{{"area", number}};
    if (value.format == std::remove_reference_t<decltype(value)>::kConstant) {
      entry["value"] = quantity(static_cast<double>(value.value), itemCode);
    } else {
      entry.update(dataFile(value.file));
    }
    report.push_back(std::move(entry));
  }
  return report;
}

// The same for each entry of a module.
template <class Module, class List>
Json describeEntryAreas(List& list) {
  Json report = Json::array();
  for (int entry = 1; entry <= list.GetCount(); ++entry) {
    report.push_back({{"name", Module::name(list, entry)},
                      {"areas", describeAreas(list.at(entry), Module::quantity(list, entry))}});
  }
  return report;
}

// A direction's coefficient, a constant or a map for each area.
template <class Files>
Json describeDispersionAlong(bool isConstant, double constant, Files& files) {
  if (isConstant) return {{"value", quantity(constant, item::kDispersionCoefficient)}};
  Json areas = Json::array();
  for (int area = 1; area <= files.GetCount(); ++area) {
    areas.push_back({{"area", area}});
    areas.back().update(dataFile(files.at(area).file));
  }
  return {{"areas", areas}};
}
template <class Coefs>
Json describeDispersion(Coefs& coefs) {
  if (coefs.proportional != 0) {
    return {{"proportional_to_current", true},
            {"factor_x", quantity(coefs.factorX, item::kDispersionCoefficient)},
            {"factor_y", quantity(coefs.factorY, item::kDispersionCoefficient)},
            {"least", quantity(coefs.minimum, item::kDispersionCoefficient)},
            {"greatest", quantity(coefs.maximum, item::kDispersionCoefficient)}};
  }
  return {{"proportional_to_current", false},
          {"x", describeDispersionAlong(coefs.formatX == Coefs::kConstant, coefs.constantX, coefs.filesX)},
          {"y", describeDispersionAlong(coefs.formatY == Coefs::kConstant, coefs.constantY, coefs.filesY)}};
}

Json describeLinesOrBoxes(LineOrBoxList& list);
Json describeMassFiles(MassFileList& list);
Json describeTransportOutput(const TransportOutput& output);

template <class Results>
Json describeTransportOutputs(Results& results) {
  Json report = Json::array();
  for (int number = 1; number <= results.outputs.GetCount(); ++number)
    report.push_back(describeTransportOutput(results.outputs.at(number)));
  return report;
}

// Each told with a label of its own, from what was described.
std::string wordsOfConcentrations(const Json& report);
std::string wordsOfAreas(const Json& areas);
void printPlaces(std::string_view label, const Json& places, const Line& line);
void printEntryAreas(std::string_view label, const Json& entries, const Line& line);
void printDispersion(const Json& report, const Line& line);
void printLinesOrBoxes(std::string_view label, const Json& report, const Line& line);
void printMassFiles(const Json& report, const Line& line);
void printTransportOutputs(const Json& report, const Line& line);

}  // namespace gridbay::cli
