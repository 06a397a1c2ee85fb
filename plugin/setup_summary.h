#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <vector>

#include "core/date_time.h"
#include "platform/units/edit_style.h"

namespace gridbay {

class CGlobalKvs;

// A setup in a few lines, each of which leads to its page.
struct SetupSummary {
  struct Line {
    std::int32_t page;
    std::string subject;  // "Area 1"
    std::string text;     // "244 x 175 points, 90 m apart, estuary.tsb2"
    bool isKnown = true;  // false for what is missing, or shows only once the grids have been read

    bool operator==(const Line&) const = default;
  };

  std::vector<Line> lines;
  // Begin and end of the simulation.
  std::array<DateTime, 2> period;
  // Whether the model holds the grids of all areas.
  bool gridsAreRead = false;
};

// What the model holds now, with no file looked at. Times are in the units of the choices, spacings in
// metres.
SetupSummary summaryOf(CGlobalKvs& model, const UnitChoices& units);

}  // namespace gridbay
