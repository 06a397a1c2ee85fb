#pragma once

#include <span>

#include "cli/info_report.h"
#include "core/selections.h"
#include "setup/global_kvs.h"

// The parts of what `info` tells of a setup's modules, and the words that they share.

namespace gridbay::cli {

// A part of the report: its key, what the model holds of it, and how that is told to a reader.
struct Topic {
  const char* key;
  Json (*describe)(CGlobalKvs& model);
  void (*print)(const Json& report, const Line& line);
};

// Rain, evaporation, sources and infiltration.
std::span<const Topic> waterTopics();
// What drives the boundaries, levels at the start, wind, viscosity and resistance.
std::span<const Topic> conditionTopics();
// Dikes, weirs, culverts, and what the calculation writes.
std::span<const Topic> structureTopics();

// What is dissolved in the water.
std::span<const Topic> advectionDispersionTopics();
// The sediment in the water and on the bed, of either module.
std::span<const Topic> mudTransportTopics();
std::span<const Topic> expandedMudTopics();
// The ecological model.
std::span<const Topic> ecologyTopics();

// The module that runs beside the flow calculation; one without topics has no name.
struct ModuleTopics {
  std::int32_t code = 0;
  const char* key = "";
  std::string_view words = "hydrodynamics alone";
  std::span<const Topic> (*topics)() = nullptr;
};
const ModuleTopics& topicsOf(std::int32_t moduleCode);

// A value in the base unit of its quantity.
Json quantity(double value, int itemCode);
std::string wordsOfQuantity(const Json& value);
// A data file and the items chosen in it.
Json dataFile(const UTsbSelection& selection);
std::string wordsOfFile(const Json& from);

}  // namespace gridbay::cli
