#include "map/nested_grid.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <limits>

#include "basic/grid_file.h"
#include "conversion/history.h"
#include "conversion/raster_reader.h"
#include "conversion/raster_sampler.h"
#include "conversion/tsb_raster.h"
#include "core/land_value.h"
#include "map/map_coordinates.h"
#include "platform/files/may_write.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr float kNone = std::numeric_limits<float>::quiet_NaN();
// The way into the projection of a raster that is seen on the map.
RasterSampler::ToRaster fromMap(MapCoordinates& coordinates, const std::string& projection) {
  return [&coordinates, projection](std::span<double> pairs) -> Outcome {
    std::vector<MapPoint> points;
    for (std::size_t i = 0; i + 1 < pairs.size(); i += 2) points.push_back({pairs[i], pairs[i + 1]});
    if (const std::string fault = coordinates.fromMap(projection, points); !fault.empty())
      return Failure{"The raster " + fault};
    for (std::size_t i = 0; i < points.size(); ++i) {
      pairs[2 * i] = points[i].east;
      pairs[2 * i + 1] = points[i].north;
    }
    return {};
  };
}

TsbDefinition definitionOf(const MapCoordinates& coordinates, const MapArea& outer, const AreaPlace& place,
                           const std::string& raster, const std::string& file) {
  const bool isTurned = TsbGeography{{}, 0, 0, outer.rotation}.isTurned();
  TsbDefinition definition;
  definition.title = std::filesystem::path(file).stem().string();
  definition.history = historyWith({}, fmt::format("nested area cut from {}", raster));
  definition.time.type = TsbTimeAxisType::relativeEquidistant;
  const double dx = std::hypot(place.grid.stepJ.east, place.grid.stepJ.north);
  const double dy = std::hypot(place.grid.stepK.east, place.grid.stepK.north);
  definition.axes = {{static_cast<std::size_t>(place.nx), isTurned ? 0 : place.grid.first.east, dx, "m"},
                     {static_cast<std::size_t>(place.ny), isTurned ? 0 : place.grid.first.north, dy, "m"}};
  const QunItem* quantity = qunFindItem(item::kBathymetry);
  definition.items = {{quantity == nullptr ? std::string("Bathymetry") : std::string(quantity->name),
                       item::kBathymetry, "m"}};
  definition.customBlocks = {{"V27_Misc", {0, 0, 0, outer.landValue}}};
  TsbGeography there{coordinates.projection().Wkt(), 0, 0, outer.rotation};
  if (coordinates.projection().Proj2Geo(place.grid.first.east, place.grid.first.north, &there.longitude,
                                        &there.latitude))
    definition.geography = there;
  return definition;
}

}  // namespace

Outcome cutNestedGrid(const std::string& projection, const MapScene& scene, const AreaPlace& place,
                      const std::string& raster, const std::string& file,
                      const std::function<bool(double)>& progress) {
  const MapArea* outer = scene.area(place.enclosing);
  if (outer == nullptr || !outer->isPlaced || place.nx < 1) return Failure{"There is no area around it"};
  std::vector<std::string> inputs{raster};
  for (const MapArea& area : scene.areas) inputs.push_back(area.file);
  if (const Outcome free = mayWrite(file, true, inputs, {}); !free) return free;

  const Result<std::unique_ptr<Raster>> around = openTsbRaster(outer->file, outer->item);
  if (!around) return Failure{around.error()};
  MapCoordinates coordinates;
  coordinates.setProjection(projection);
  RasterSampler enclosing(**around, outer->landValue, fromMap(coordinates, (*around)->projection()));

  // A grid file is sampled here; other rasters come from their library on the points of the grid.
  const bool isGridFile = isTsbRaster(raster);
  const bool isLocal = coordinates.isLocal();
  WarpTarget target{
      .projection = isLocal ? std::string() : scene.projectionText, .columns = place.nx, .rows = place.ny};
  target.place = {{place.grid.first.east, place.grid.first.north},
                  {place.grid.stepJ.east, place.grid.stepJ.north},
                  {place.grid.stepK.east, place.grid.stepK.north}};
  // A raster that names no projection, as texts of heights do, lies in that of the map.
  if (!isGridFile && !isLocal) {
    const Result<std::unique_ptr<Raster>> plain = openAnyRaster(raster, 0);
    if (plain && (*plain)->projection().empty()) target.from = target.projection;
  }
  const Result<std::unique_ptr<Raster>> source =
      isGridFile ? openTsbRaster(raster, 1) : openWarpedRaster(raster, 0, target);
  if (!source) return Failure{source.error()};
  if ((*source)->bands() < 1) return Failure{fmt::format("\"{}\" holds no map", raster)};
  (*source)->choose(1);
  std::optional<RasterSampler> sampler;
  float land = kNone;  // of the grid file that is cut from
  if (isGridFile) {
    TsbHeader header;
    if (tsbFileRead(raster, &header) == 0) {
      const Result<std::optional<float>> known = landValueOf(header.file->definition());
      if (known) land = known->value_or(kNone);
    }
    sampler.emplace(**source, land, fromMap(coordinates, (*source)->projection()));
  }

  Result<TsbWriter> writer = TsbWriter::create(file, definitionOf(coordinates, *outer, place, raster, file));
  if (!writer) return Failure{writer.error()};
  const auto columns = static_cast<std::size_t>(place.nx);
  constexpr std::size_t kPointsAtOnce = std::size_t{1} << 22;
  constexpr std::size_t kMostRows = 256;
  const int rowsAtOnce = static_cast<int>(std::clamp<std::size_t>(kPointsAtOnce / columns, 1, kMostRows));
  bool hasAny = false;
  std::vector<float> values;
  std::vector<float> behind;
  for (int first = 0; first < place.ny; first += rowsAtOnce) {
    const int rows = std::min(rowsAtOnce, place.ny - first);
    values.assign(columns * static_cast<std::size_t>(rows), kNone);
    behind = values;
    std::string why;
    if (sampler) {
      if (const Outcome done = sampler->sampleRows(target.place, place.nx, first, values); !done)
        return Failure{fmt::format("cannot cut from \"{}\": {}", raster, done.error())};
      // Its land stays land by the value of the enclosing area.
      for (float& value : values) {
        if (value >= land) value = std::max(value, outer->landValue);
      }
    } else if (!(*source)->read(first, values, &why)) {
      return Failure{fmt::format("cannot read \"{}\": {}", raster, why)};
    }
    const std::optional<double> missing = (*source)->missingValue();
    const auto isMissing = [&missing](float value) {
      return !std::isfinite(value) || (missing && value == static_cast<float>(*missing));
    };
    const auto gone = std::ranges::count_if(values, isMissing);
    hasAny = hasAny || static_cast<std::size_t>(gone) < values.size();
    if (gone > 0) {
      if (const Outcome done = enclosing.sampleRows(target.place, place.nx, first, behind); !done)
        return Failure{fmt::format("cannot read \"{}\": {}", outer->file, done.error())};
      for (std::size_t i = 0; i < values.size(); ++i) {
        if (isMissing(values[i])) values[i] = std::isfinite(behind[i]) ? behind[i] : outer->landValue;
      }
    }
    if (const Outcome done = writer->writeRows(1, 0, static_cast<std::size_t>(first), values); !done)
      return done;
    if (progress && !progress(static_cast<double>(first + rows) / place.ny))
      return Failure{"The new area was stopped; nothing is written"};
  }
  if (!hasAny) return Failure{fmt::format("\"{}\" has no values in the rectangle", raster)};
  return writer->commit();
}

}  // namespace gridbay
