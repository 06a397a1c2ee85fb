#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "core/grid_point.h"
#include "core/page_place.h"
#include "setup/path_setting.h"

namespace gridbay {

// What mends a thing: keywords with other values, all to be set in their order or none.
struct AdviceFix {
  std::string name;  // of the step, as in "Undo Move area 2"
  std::vector<Setting> settings = {};

  bool operator==(const AdviceFix&) const = default;
};

// Where it lies: points of an area's grid, or points in a projection (metres).
struct AdviceSite {
  struct MapPoint {
    double easting = 0;
    double northing = 0;

    bool operator==(const MapPoint&) const = default;
  };

  int area = 0;  // from 1; 0 where there are no grid points
  std::vector<GridPoint> points = {};
  std::string projection = {};
  std::vector<MapPoint> mapPoints = {};

  bool operator==(const AdviceSite&) const = default;
};

// Something in a setup that is no fault and yet doubtful.
struct Advice {
  std::string_view kind;  // the rule that gave it, as "area-position"
  std::string doubt;      // what is doubtful, in a sentence
  std::string reason;     // why that matters
  PagePlace place;
  AdviceSite site = {};
  std::optional<AdviceFix> fix = {};

  bool operator==(const Advice&) const = default;
};

}  // namespace gridbay
