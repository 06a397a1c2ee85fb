#pragma once

#include <functional>
#include <string>

#include "map/map_editor.h"
#include "platform/result.h"

namespace gridbay {

// Cuts the grid of a nested area, where a map would place it, from a raster of any kind into a grid file.
// Points between those of the raster are interpolated; where it has no value the grid of the enclosing area
// stands. The map is given as it was: its projection by the text that Area 1's file has, and its scene. An
// error, or a progress (0 to 1) that says no, leaves what is at the path as it was.
Outcome cutNestedGrid(const std::string& projection, const MapScene& scene, const AreaPlace& place,
                      const std::string& raster, const std::string& file,
                      const std::function<bool(double)>& progress);

}  // namespace gridbay
