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
  dikes = 31,
  massBudget = 34,
  moduleSelection = 35,
  simulationPeriod = 39,
  sourceAndSink = 40,
};

}  // namespace gridbay
