#pragma once

#include <fmt/format.h>

#include <algorithm>

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

// The value of an entry, in the unit of its declaration where the module's entries are declared.
template <class Module>
Json quantityOfEntry(CKvsBase& object, int entry, double value, int itemCode) {
  Json told = quantity(value, itemCode);
  if constexpr (requires { Module::declaration(object, entry); }) {
    if (const auto* declared = Module::declaration(object, entry); declared != nullptr)
      told["unit"] = declared->unit;
  }
  return told;
}

// The constant of each entry that there is, or the file that gives them.
template <class Module, class Values, class QuantityOf>
Json describeConcentrations(CKvsBase& object, Values& values, std::string_view fileKind,
                            const QuantityOf& quantityOf) {
  if (!fileKind.empty()) {
    Json report{{"given_as", fileKind}};
    report.update(dataFile(values.file));
    return report;
  }
  Json report{{"given_as", "constant"}, {"values", Json::array()}};
  const int entries = std::min(static_cast<int>(values.constants.size()), Module::count(object));
  for (int entry = 1; entry <= entries; ++entry) {
    Json value = quantityOfEntry<Module>(object, entry, static_cast<double>(*values.Constant(entry)),
                                         quantityOf(entry));
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

// An entry for each area of what has a format, a value and a file there; `told` describes the value.
template <class Areas, class Told>
Json describeAreasAs(Areas& areas, const Told& told) {
  Json report = Json::array();
  for (int number = 1; number <= areas.GetCount(); ++number) {
    auto& value = areas.at(number);
    Json entry{{"area", number}};
    if (value.format == std::remove_reference_t<decltype(value)>::kConstant) {
      entry["value"] = told(static_cast<double>(value.value));
    } else {
      entry.update(dataFile(value.file));
    }
    report.push_back(std::move(entry));
  }
  return report;
}
template <class Areas>
Json describeAreas(Areas& areas, int itemCode) {
  return describeAreasAs(areas, [itemCode](double value) { return quantity(value, itemCode); });
}

// The same for each entry of a module.
template <class Module, class List>
Json describeEntryAreas(List& list) {
  Json report = Json::array();
  for (int entry = 1; entry <= list.GetCount(); ++entry) {
    report.push_back({{"name", Module::name(list, entry)},
                      {"areas", describeAreasAs(list.at(entry), [&list, entry](double value) {
                         return quantityOfEntry<Module>(list, entry, value, Module::quantity(list, entry));
                       })}});
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

// The values of a list that has a constant or maps for all areas, as the layers of the bed; numbered from 1.
template <class List>
Json describeConstantsOrMaps(List& list, int itemCode) {
  Json report = Json::array();
  for (int number = 1; number <= list.GetCount(); ++number) {
    auto& layer = list.at(number);
    Json entry{{"layer", number}};
    if (layer.format == std::remove_reference_t<decltype(layer)>::kConstant) {
      entry["value"] = quantity(static_cast<double>(layer.constant), itemCode);
    } else {
      entry["areas"] = Json::array();
      for (int area = 1; area <= layer.GetCount(); ++area) {
        Json map{{"area", area}};
        map.update(dataFile(layer.at(area).file));
        entry["areas"].push_back(std::move(map));
      }
    }
    report.push_back(std::move(entry));
  }
  return report;
}

// How a module begins: hot from the files of all areas, or by what `cold` describes.
template <class Start, class Cold>
Json describeBeginning(Start& start, const Cold& cold) {
  if (!start.hotStart) return {{"hot", false}, {"concentrations", cold()}};
  Json files = Json::array();
  for (int area = 1; area <= start.GetCount(); ++area) files.push_back(start.at(area).file.text());
  return {{"hot", true}, {"files", files}};
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

// The same as topics of a module whose objects are these members of the root.
template <auto list, class Module>
Json boundaryTopic(CGlobalKvs& model) {
  return describeBoundaryValues<Module>(*(model.*list));
}
template <auto list, class Module>
Json sourceTopic(CGlobalKvs& model) {
  return describeSourceValues<Module>(*(model.*list));
}
template <auto coefs>
Json dispersionTopic(CGlobalKvs& model) {
  return describeDispersion(*(model.*coefs));
}
template <auto list>
Json placesTopic(CGlobalKvs& model) {
  return describeLinesOrBoxes(*(model.*list));
}
template <auto results>
Json outputTopic(CGlobalKvs& model) {
  return describeTransportOutputs(*(model.*results));
}

// Each told with a label of its own, from what was described.
std::string wordsOfConcentrations(const Json& report);
// "32 in area 1; map r.tsb2 in area 2", and "none" for one with neither.
std::string wordsOfAreas(const Json& areas);
void printBoundaryValues(const Json& places, const Line& line);
void printSourceValues(const Json& places, const Line& line);
void printBeginning(const Json& report, const Line& line);
void printConstantsOrMaps(std::string_view label, const Json& layers, const Line& line);
void printEntryAreas(std::string_view label, const Json& entries, const Line& line);
void printWaves(const Json& report, const Line& line);
void printDispersion(const Json& report, const Line& line);
void printLines(const Json& report, const Line& line);
void printBoxes(const Json& report, const Line& line);
void printMassFiles(const Json& report, const Line& line);
void printTransportOutputs(const Json& report, const Line& line);

}  // namespace gridbay::cli
