#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "conversion/vector_file.h"
#include "map/map_scene.h"
#include "setup/global_kvs.h"

namespace gridbay {

struct GisExport {
  VectorFile file;
  std::vector<std::string> leftOut;  // what has no place: "Area 2", "Source 3 (Source and Sink)"
};

// All that a setup places, a layer for each kind that it has, in the projection of Area 1. Files are named
// from the folder of the setup at `setupPath`.
GisExport gisLayers(CGlobalKvs& root, const MapScene& scene, std::string_view setupPath);

}  // namespace gridbay
