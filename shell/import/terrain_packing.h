#pragma once

#include <string>

#include "conversion/raster_preview.h"
#include "platform/result.h"

namespace gridbay::shell {

// What comes of work in a copy of this process, as bytes on its way back.
std::string packed(const Result<RasterPreview>& preview);
std::string packed(const Result<ConvertedRaster>& converted);
Result<RasterPreview> unpackedPreview(const std::string& bytes);
// The words about the map that was made.
Result<std::string> unpackedSummary(const std::string& bytes);

}  // namespace gridbay::shell
