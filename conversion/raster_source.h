#pragma once

#include <memory>
#include <string>

#include "conversion/conversion_host.h"
#include "conversion/raster.h"
#include "conversion/raster_conversion.h"
#include "platform/cartography/cartography.h"
#include "platform/result.h"

namespace gridbay {

// What a map is made from: a raster as the options bring it to a grid.
struct RasterSource {
  std::unique_ptr<Raster> raster;
  bool isOfPoints = false;
};

// An error where a unit of the projection is none of a metre.
Outcome checkMetres(const CVdMapProjection& projection);

// That a text names no projection, with those that it may mean.
std::string unknownProjection(const std::string& text);

// Opens what the options name, and chooses what they ask for; the host is told what else there would be.
// Points that are given no spacing have one by their mean distance where `guessSpacing`, else they are an
// error.
Result<RasterSource> openRasterSource(const RasterConversion& options, ConversionHost& host,
                                      bool guessSpacing = false);

}  // namespace gridbay
