#pragma once

#include <QString>
#include <vector>

#include "advice/advice.h"
#include "map/map_scene.h"

namespace gridbay::shell {

// A place on the map that advice speaks of.
struct AdviceMark {
  MapPoint place;
  std::vector<int> advice;  // by their places in the document's list
  QString tip;

  bool operator==(const AdviceMark&) const = default;
};

// A mark for each place; advice on what has no place on the map has none.
std::vector<AdviceMark> marksOf(const std::vector<Advice>& advice, const MapScene& scene);

}  // namespace gridbay::shell
