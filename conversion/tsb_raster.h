#pragma once

#include <memory>
#include <string>

#include "conversion/raster.h"
#include "platform/result.h"

namespace gridbay {

// Whether a path leads to a data file of our own, by its content or at least by its name.
bool isTsbRaster(const std::string& path);

// A map of our own as a raster: its items are the rasters in the file, its time steps their bands.
Result<std::unique_ptr<Raster>> openTsbRaster(const std::string& path, int subdataset);

}  // namespace gridbay
