#pragma once

#include <QString>
#include <limits>
#include <optional>
#include <span>

#include "map/map_scene.h"

namespace gridbay::shell {

// What a click or a drag on the map does.
enum class MapTool {
  select,
  nestedArea,
  source,
  pair,
  boundary,
  massBudget,
  dike,
  weir,
  culvert,
  outputPoint,
  outputLine,
  outputArea,
  moduleOutputPoint,  // of the module that is chosen
  moduleOutputLine,
  moduleOutputArea,
  discharge,
  box,
  pick
};

// How many clicks a tool takes.
struct MapClicks {
  static constexpr std::size_t kAny = std::numeric_limits<std::size_t>::max();

  std::size_t least = 0;
  std::size_t most = 0;  // 0 for a tool that is dragged
};

// A tool that places something: what it is called, and what is clicked on, first and then.
struct PlacingTool {
  MapTool tool;
  std::optional<MapKind> kind;  // of what it makes; none for an area
  MapClicks clicks;
  const char* name;
  const char* key;  // while the map has the keyboard
  const char* first;
  const char* next;
  bool endsGroup = false;  // of its menu
};

// All of them, in the order of the menu.
std::span<const PlacingTool> placingTools();
// Null for a tool that places nothing.
const PlacingTool* placingTool(MapTool tool);

// What to do next with a number of clicks made: "Dike: click the first point. Esc puts it down."
QString hintOf(const QString& name, const QString& action, MapClicks clicks, std::size_t made);
QString hintOf(const PlacingTool& tool, std::size_t made);

}  // namespace gridbay::shell
