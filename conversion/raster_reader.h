#pragma once

#include <memory>
#include <string>

#include "conversion/raster.h"
#include "platform/result.h"

namespace gridbay {

// A raster of any kind, by the path of a file or a name of the raster library. With a `subdataset` (from 1, 0
// for none) that of the rasters in the file.
Result<std::unique_ptr<Raster>> openAnyRaster(const std::string& path, int subdataset);

// The same brought to another grid by the raster library, band by band as they are chosen. It reads no maps
// of our own.
Result<std::unique_ptr<Raster>> openWarpedRaster(const std::string& path, int subdataset,
                                                 const WarpTarget& target);
// The same of the chosen band of a raster that is open, which may be a map of our own.
Result<std::unique_ptr<Raster>> warpRaster(Raster& raster, const WarpTarget& target);
// A grid of points that lie anywhere.
Result<std::unique_ptr<Raster>> gridPoints(PointGrid points);

// An entry point of the module through which the raster library is used, which stands beside the library that
// this code is in, or else beside the program. It is loaded when it is first asked for.
Result<void*> rasterModuleEntry(const char* name);

}  // namespace gridbay
