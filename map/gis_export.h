#pragma once

#include <string>

#include "conversion/vector_file.h"
#include "map/map_scene.h"
#include "platform/result.h"
#include "setup/global_kvs.h"

namespace gridbay {

// All that a setup places, a layer for each kind that it has, in the projection of Area 1. What can't be
// placed is left out, and counted in `leftOut` where one is given.
VectorFile gisLayers(CGlobalKvs& root, const MapScene& scene, int* leftOut = nullptr);

}  // namespace gridbay
