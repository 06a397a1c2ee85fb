#pragma once

#include <string>

#include "conversion/vector_file.h"
#include "platform/result.h"

namespace gridbay {

// Writes a GeoPackage (*.gpkg). It has its name only once all of it is written; until then, and on an error,
// a file that was there is as it was.
Outcome writeGeoPackage(const std::string& path, const VectorFile& file);

}  // namespace gridbay
