#include "map/nested_grid.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <limits>

#include "basic/grid_file.h"
#include "conversion/history.h"
#include "conversion/raster_reader.h"
#include "conversion/tsb_raster.h"
#include "core/land_value.h"
#include "map/map_coordinates.h"
#include "platform/files/may_write.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr float kNone = std::numeric_limits<float>::quiet_NaN();
constexpr std::size_t kMostKept = std::size_t{1} << 23;  // points of a raster, unless two rows have more
constexpr int kBlock = 256;                              // points along the edge of what is cut at once

// Values of a raster at any places on the map, by the four points around each. Where one of them is land the
// nearest one counts, so that a coast stays where it is.
class Sampler {
 public:
  Sampler(Raster& raster, MapCoordinates& coordinates, std::string projection, float landValue)
      : raster_(raster), coordinates_(coordinates), projection_(std::move(projection)), land_(landValue) {
    const RasterPlace at = raster.place();
    grid_ = {
        {at.first[0], at.first[1]}, {at.nextColumn[0], at.nextColumn[1]}, {at.nextRow[0], at.nextRow[1]}};
  }

  // Not-a-number where there is none. An error when the raster can't be read.
  Outcome sample(std::vector<MapPoint> places, std::span<float> values) {
    if (const std::string fault = coordinates_.fromMap(projection_, places); !fault.empty())
      return Failure{"The raster " + fault};
    for (MapPoint& place : places) {
      const auto [column, row] = grid_.pointOf(place);
      place = {column, row};
    }
    std::ranges::fill(values, kNone);
    return sampleAt(places, values);
  }

 private:
  // By columns and rows of the raster. What needs too much of it at once is done in two halves.
  Outcome sampleAt(std::span<const MapPoint> places, std::span<float> values) {
    int least = raster_.rows();
    int most = -1;
    for (const MapPoint& place : places) {
      if (!isInside(place)) continue;
      least = std::min(least, static_cast<int>(std::max(std::floor(place.north), 0.0)));
      most = std::max(most, std::min(static_cast<int>(std::floor(place.north)) + 1, raster_.rows() - 1));
    }
    if (most < least) return {};
    const auto needed =
        static_cast<std::size_t>(most - least + 1) * static_cast<std::size_t>(raster_.columns());
    if (needed > kMostKept && places.size() > 1) {
      const std::size_t half = places.size() / 2;
      if (const Outcome done = sampleAt(places.first(half), values.first(half)); !done) return done;
      return sampleAt(places.subspan(half), values.subspan(half));
    }
    if (const Outcome done = keep(least, most); !done) return done;
    for (std::size_t i = 0; i < places.size(); ++i) {
      if (isInside(places[i])) values[i] = between(places[i]);
    }
    return {};
  }

  // Up to half a point beyond the outermost ones.
  bool isInside(MapPoint at) const {
    constexpr double kHalf = 0.5 + 1e-6;
    return at.east >= -kHalf && at.north >= -kHalf && at.east <= raster_.columns() - 1 + kHalf &&
           at.north <= raster_.rows() - 1 + kHalf;
  }
  Outcome keep(int first, int last) {
    const auto columns = static_cast<std::size_t>(raster_.columns());
    if (first >= firstRow_ && last < firstRow_ + rows_) return {};
    rows_ = last - first + 1;
    firstRow_ = first;
    kept_.resize(columns * static_cast<std::size_t>(rows_));
    std::string why;
    if (raster_.read(first, kept_, &why)) return {};
    rows_ = 0;
    return Failure{why};
  }
  float at(int column, int row) const {
    const std::optional<double> missing = raster_.missingValue();
    const float value =
        kept_[static_cast<std::size_t>(row - firstRow_) * static_cast<std::size_t>(raster_.columns()) +
              static_cast<std::size_t>(column)];
    return missing && value == static_cast<float>(*missing) ? kNone : value;
  }
  float between(MapPoint place) const {
    const double column = std::clamp(place.east, 0.0, raster_.columns() - 1.0);
    const double row = std::clamp(place.north, 0.0, raster_.rows() - 1.0);
    const int left = static_cast<int>(column);
    const int low = static_cast<int>(row);
    const int right = std::min(left + 1, raster_.columns() - 1);
    const int high = std::min(low + 1, raster_.rows() - 1);
    const double x = column - left;
    const double y = row - low;
    const std::array<float, 4> near{at(left, low), at(right, low), at(left, high), at(right, high)};
    const auto isSpecial = [this](float value) { return !std::isfinite(value) || value >= land_; };
    if (std::ranges::any_of(near, isSpecial)) return near[(x > 0.5 ? 1U : 0U) + (y > 0.5 ? 2U : 0U)];
    return static_cast<float>((near[0] * (1 - x) + near[1] * x) * (1 - y) +
                              (near[2] * (1 - x) + near[3] * x) * y);
  }

  Raster& raster_;
  MapCoordinates& coordinates_;
  std::string projection_;
  float land_;
  MapGrid grid_;
  std::vector<float> kept_;
  int firstRow_ = 0;
  int rows_ = 0;
};

// The values of some rows of a grid, block by block, so that those of a raster that is turned against it lie
// near each other.
Outcome sampleRows(Sampler& sampler, const AreaPlace& place, int firstRow, int rows,
                   std::span<float> values) {
  const auto columns = static_cast<std::size_t>(place.nx);
  std::vector<MapPoint> places;
  std::vector<float> block;
  for (int firstColumn = 0; firstColumn < place.nx; firstColumn += kBlock) {
    const int across = std::min(kBlock, place.nx - firstColumn);
    places.clear();
    for (int k = firstRow; k < firstRow + rows; ++k) {
      for (int j = firstColumn; j < firstColumn + across; ++j) places.push_back(place.grid.at(j, k));
    }
    block.resize(places.size());
    if (const Outcome done = sampler.sample(places, block); !done) return done;
    for (std::size_t row = 0; row < static_cast<std::size_t>(rows); ++row)
      std::ranges::copy(
          std::span(block).subspan(row * static_cast<std::size_t>(across), static_cast<std::size_t>(across)),
          values.begin() +
              static_cast<std::ptrdiff_t>(row * columns + static_cast<std::size_t>(firstColumn)));
  }
  return {};
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
  const std::string own = (*around)->projection();
  Sampler enclosing(**around, coordinates, own, outer->landValue);

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
  std::optional<Sampler> sampler;
  float land = kNone;  // of the grid file that is cut from
  if (isGridFile) {
    TsbHeader header;
    if (tsbFileRead(raster, &header) == 0) {
      const Result<std::optional<float>> known = landValueOf(header.file->definition());
      if (known) land = known->value_or(kNone);
    }
    sampler.emplace(**source, coordinates, (*source)->projection(), land);
  }

  Result<TsbWriter> writer = TsbWriter::create(file, definitionOf(coordinates, *outer, place, raster, file));
  if (!writer) return Failure{writer.error()};
  const auto columns = static_cast<std::size_t>(place.nx);
  constexpr std::size_t kPointsAtOnce = std::size_t{1} << 22;
  const int rowsAtOnce = static_cast<int>(std::clamp<std::size_t>(kPointsAtOnce / columns, 1, kBlock));
  bool hasAny = false;
  std::vector<float> values;
  std::vector<float> behind;
  for (int first = 0; first < place.ny; first += rowsAtOnce) {
    const int rows = std::min(rowsAtOnce, place.ny - first);
    values.assign(columns * static_cast<std::size_t>(rows), kNone);
    behind = values;
    std::string why;
    if (sampler) {
      if (const Outcome done = sampleRows(*sampler, place, first, rows, values); !done)
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
      if (const Outcome done = sampleRows(enclosing, place, first, rows, behind); !done)
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
