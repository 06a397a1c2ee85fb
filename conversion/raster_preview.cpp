#include "conversion/raster_preview.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "conversion/raster_layout.h"
#include "conversion/raster_reader.h"
#include "conversion/raster_source.h"
#include "conversion/tsb_raster.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/transformation.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

// The picture of a raster as its grid would lie.
Outcome readPicture(Raster& raster, const RasterLayout& layout, int most, RasterPreview& preview) {
  preview.columns = std::min(raster.columns(), most);
  preview.rows = std::min(raster.rows(), most);
  const auto columns = static_cast<std::size_t>(preview.columns);
  std::vector<float> read(columns * static_cast<std::size_t>(preview.rows));
  std::string why;
  if (!raster.readWhole(preview.columns, preview.rows, read, &why)) return Failure{why};
  preview.values.resize(read.size());
  const std::optional<double> missing = raster.missingValue();
  for (int k = 0; k < preview.rows; ++k) {
    const int row = layout.rowsBackwards ? preview.rows - 1 - k : k;
    for (int j = 0; j < preview.columns; ++j) {
      const int column = layout.columnsBackwards ? preview.columns - 1 - j : j;
      const float value = read[static_cast<std::size_t>(row) * columns + static_cast<std::size_t>(column)];
      const bool isMissing = !std::isfinite(value) || (missing && value == static_cast<float>(*missing));
      preview.values[static_cast<std::size_t>(k) * columns + static_cast<std::size_t>(j)] =
          isMissing ? std::numeric_limits<float>::quiet_NaN() : value;
    }
  }
  return {};
}

void placeOnEarth(const RasterLayout& layout, const std::string& projection, RasterPreview& preview) {
  const CVdMapProjection map(projection);
  if (projection.empty() || !map.IsValid() || map.IsLocal()) return;
  preview.projectionName = map.Name();
  const std::array<double, 2> corner = layout.at(0, 0);
  const std::array<double, 2> opposite = layout.at(layout.columns - 1, layout.rows - 1);
  std::array<double, 2> middle{(corner[0] + opposite[0]) / 2, (corner[1] + opposite[1]) / 2};
  if (Transformation(projection, "EPSG:4326").apply(middle) && std::isfinite(middle[0] + middle[1]))
    preview.middle = middle;
}

}  // namespace

Result<RasterPreview> previewRaster(const RasterConversion& conversion, int most, ConversionHost& host) {
  RasterPreview preview;
  if (conversion.subdataset == 0 && !conversion.gridding) {
    const Result<std::unique_ptr<Raster>> file = openAnyRaster(conversion.in, 0);
    if (file) preview.rasters = (*file)->subdatasets();
    if (file && (*file)->bands() == 0 && preview.rasters.size() > 1) return preview;
  }
  Result<RasterSource> source = openRasterSource(conversion, host, true);
  if (!source) return Failure{source.error()};
  preview.isOfPoints = source->isOfPoints;
  preview.isOwnMap = !source->isOfPoints && isTsbRaster(conversion.in);
  const Result<RasterLayout> layout =
      layoutOf(source->raster->place(), source->raster->columns(), source->raster->rows());
  if (!layout) return Failure{layout.error()};
  preview.points = {layout->columns, layout->rows};
  preview.spacing = {layout->dx, layout->dy};
  preview.first = layout->axesFirst();
  preview.rotation = layout->rotation;
  preview.hasPlace = source->raster->hasPlace();
  preview.unit = source->raster->otherUnit();
  preview.projection =
      conversion.crs.empty() || !conversion.reproject.empty() ? source->raster->projection() : conversion.crs;
  preview.valueUnit = source->raster->unit();
  if (const std::optional<int> type = source->raster->itemType(); type && qunFindItem(*type) != nullptr)
    preview.itemType = qunFindItem(*type)->name;
  preview.landValue = source->raster->landValue();
  for (int band = 1; band <= source->raster->bands(); ++band)
    preview.bands.push_back(source->raster->bandName(band));
  placeOnEarth(*layout, preview.projection, preview);

  // What has to be worked out is worked out at the points of the picture alone.
  const double part = std::max(layout->columns, layout->rows) / static_cast<double>(most);
  const bool isWarped = !conversion.reproject.empty() || conversion.resample;
  if (part > 1 && isWarped && !source->isOfPoints) {
    RasterConversion coarse = conversion;
    coarse.resample = std::max(layout->dx, layout->dy) * part;
    coarse.resampling = Resampling::nearest;
    source = openRasterSource(coarse, host, true);
    if (!source) return Failure{source.error()};
  }
  if (const Outcome done = readPicture(*source->raster, *layout, most, preview); !done)
    return Failure{done.error()};
  return preview;
}

}  // namespace gridbay
