#pragma once

#include <QRectF>
#include <QString>
#include <array>
#include <cstddef>
#include <optional>

#include "conversion/raster_preview.h"

namespace gridbay::shell {

// Points of a raster on either side of a land value, as far as the preview tells.
struct WetDry {
  std::size_t wet = 0;
  std::size_t dry = 0;
  std::size_t missing = 0;
  bool isExact = true;  // each point of the raster was looked at

  std::size_t all() const { return wet + dry + missing; }
};

// Where the points of a preview lie along its own axes, with a half of the spacing around.
QRectF extentOf(const RasterPreview& preview);
// The points of the grid that lie in a window (along its own axes), along J and K; none where it misses them.
std::array<int, 2> pointsIn(const RasterPreview& preview, const QRectF& window);
// Those of a window; without a land value all are wet.
WetDry countWetDry(const RasterPreview& preview, const QRectF& window, std::optional<float> land);
// A round height above all terrain, at which none of it is land.
float landAbove(const RasterPreview& preview);
// The zone of UTM (WGS 84), or of the south, that holds the middle of a raster; empty where that is unknown.
QString zoneOf(const RasterPreview& preview);

// What an import would make of a window, for people: points, extent, sizes in memory and on disk, wet and
// dry.
QString summaryOf(const RasterPreview& preview, const QRectF& window, std::optional<float> land);

}  // namespace gridbay::shell
