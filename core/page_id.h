#pragma once

#include <cstdint>

namespace gridbay {

// The places of the setup to which a message can lead. The numbers are fixed: they tie together the pages,
// the tree's rules and the messages.
enum class PageId : std::int32_t {
  none = 0,
  adBoundary = 9,
  adBoxSummation = 10,
  adComponent = 11,
  adDecaySpecification = 12,
  adDepositionConcentration = 13,
  adDispersionCoef = 14,
  adEvaporation = 15,
  adFeedback = 16,
  adHeatDissipation = 17,
  adHeatExchange = 18,
  adInitialConcentration = 19,
  adLineDischarge = 20,
  adMassBudget = 21,
  adPrecipitation = 22,
  adResult = 23,
  adSourceSink = 24,
  adStartingConditions = 25,
  floodAndDry = 26,
  bathymetry = 27,
  boundary = 28,
  hdBoundary = 29,
  culverts = 30,
  dikes = 31,
  eddyViscosity = 32,
  massBudget = 34,
  moduleSelection = 35,
  resistance = 37,
  hdResult = 38,
  simulationPeriod = 39,
  sourceAndSink = 40,
  hdSourceAndSink = 41,
  surfaceElevation = 43,
  waveRadiation = 44,
  weirs = 45,
  windConditions = 46,
  waves = 142,
  infiltration = 143,
  adInfiltration = 145,
};

}  // namespace gridbay
