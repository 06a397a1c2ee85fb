#pragma once

#include <string>

#include "map/map_scene.h"

namespace gridbay {

// How far an area reaches in the one that is to enclose it, and what would nest there, beside what the check
// says of it; empty for one that nests. Both have grids.
std::string nestingWords(const MapArea& inner, const MapArea& outer);

}  // namespace gridbay
