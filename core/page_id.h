#pragma once

#include <cstdint>

namespace gridbay {

// The places of the setup to which a message can lead. The numbers are fixed: they tie together the pages,
// the tree's rules and the messages.
enum class PageId : std::int32_t {
  none = 0,
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
};

}  // namespace gridbay
