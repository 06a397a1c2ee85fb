#pragma once

#include <string>

#include "conversion/background.h"
#include "conversion/raster_preview.h"
#include "conversion/series_table.h"
#include "conversion/table_guess.h"
#include "platform/result.h"

namespace gridbay::shell {

// What comes of work in a copy of this process, as bytes on its way back.
std::string packed(const Result<RasterPreview>& preview);
std::string packed(const Result<ConvertedRaster>& converted);
std::string packed(const Result<BackgroundCopy>& copy);
std::string packed(TableGuess guess);
std::string packed(Result<SeriesTable> table);
std::string packed(const Result<ConvertedSeries>& converted);
Result<RasterPreview> unpackedPreview(const std::string& bytes);
TableGuess unpackedGuess(const std::string& bytes);
Result<SeriesTable> unpackedTable(const std::string& bytes);
// The words about the map or series that was made.
Result<std::string> unpackedSummary(const std::string& bytes);
Result<BackgroundCopy> unpackedCopy(const std::string& bytes);

}  // namespace gridbay::shell
