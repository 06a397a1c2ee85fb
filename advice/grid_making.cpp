#include "advice/grid_making.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <memory>
#include <optional>
#include <span>
#include <type_traits>
#include <utility>
#include <vector>

#include "advice/fix_files.h"
#include "advice/series_mending.h"
#include "basic/grid_file.h"
#include "conversion/history.h"
#include "conversion/raster_sampler.h"
#include "conversion/tsb_raster.h"
#include "core/land_value.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/transformation.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"

namespace gridbay {
namespace {

// Rows of an item at a time step, and where they are.
template <class Number>
struct GridRows {
  std::size_t item;
  std::size_t step;
  std::size_t first;
  std::span<Number> values;
};

// Writes a grid of the rows that `fill` makes, some at a time.
template <class Fill>
Outcome writeGrid(const std::string& path, const TsbDefinition& definition, const FileProgress& progress,
                  const Fill& fill) {
  constexpr std::size_t kPointsAtOnce = std::size_t{1} << 20;
  Result<TsbWriter> to = TsbWriter::create(path, definition);
  if (!to) return Failure{to.error()};
  const std::size_t columns = definition.axes[0].points;
  const std::size_t rows = definition.axes[1].points;
  const std::size_t rowsAtOnce = std::max<std::size_t>(kPointsAtOnce / columns, 1);
  const double all =
      static_cast<double>(definition.items.size() * definition.time.count) * static_cast<double>(rows);
  double done = 0;
  const auto writeItem = [&]<class Number>(std::size_t item, std::vector<Number> values) -> Outcome {
    for (std::size_t step = 0; step < definition.time.count; ++step) {
      for (std::size_t first = 0; first < rows; first += rowsAtOnce) {
        const std::size_t count = std::min(rowsAtOnce, rows - first);
        values.resize(count * columns);
        if (Outcome filled = fill(GridRows<Number>{item, step, first, values}); !filled) return filled;
        if (Outcome written = to->writeRows(item, step, first, std::span<const Number>(values)); !written)
          return written;
        done += static_cast<double>(count);
        if (progress && !progress(done / all)) return Failure{std::string(kFixStopped)};
      }
    }
    return {};
  };
  for (std::size_t item = 1; item <= definition.items.size(); ++item) {
    if (Outcome written = definition.items[item - 1].isDouble ? writeItem(item, std::vector<double>())
                                                              : writeItem(item, std::vector<float>());
        !written)
      return written;
  }
  return to->commit();
}

Result<TsbFile> openGrid(const std::string& path) {
  Result<TsbFile> file = TsbFile::open(path);
  if (file && file->definition().axes.size() != 2) return Failure{fmt::format("{} holds no map", path)};
  return file;
}

// A copy of a grid, with what `define` makes of its definition and `change` of its rows.
template <class Define, class Change>
Outcome copyGrid(const std::string& fromPath, const std::string& toPath, const FileProgress& progress,
                 const std::string& how, const Define& define, const Change& change) {
  const Result<TsbFile> from = openGrid(fromPath);
  if (!from) return Failure{from.error()};
  TsbDefinition definition = from->definition();
  definition.history = historyWith(definition.history, how);
  define(definition);
  return writeGrid(toPath, definition, progress, [&](const auto& rows) -> Outcome {
    if (Outcome read = from->readRows(rows.item, rows.step, rows.first, rows.values); !read) return read;
    return change(definition, rows);
  });
}

void setLocation(TsbDefinition& file, const GridLocation& location) {
  file.axes[0].first = location.firstX;
  file.axes[1].first = location.firstY;
  file.geography.reset();
  if (!CVdMapProjection::IsLocal(location.projection))
    file.geography =
        TsbGeography{location.projection, location.longitude, location.latitude, location.rotation};
}

// A grid's elevations at other points; not-a-number beyond them.
class ElevationSampler {
 public:
  static Result<ElevationSampler> open(const std::string& path, std::size_t item, std::size_t step,
                                       float landValue, const std::string& projection) {
    Result<std::unique_ptr<Raster>> raster = openTsbRaster(path, static_cast<int>(item));
    if (!raster) return Failure{raster.error()};
    (*raster)->choose(static_cast<int>(step) + 1);
    const CVdMapProjection own((*raster)->projection());
    const CVdMapProjection other(projection);
    RasterSampler::ToRaster way = [](std::span<double>) { return Outcome(); };
    if (own.GetProjectionString() != other.GetProjectionString()) {
      auto there = std::make_shared<Transformation>(projection, (*raster)->projection());
      if (!there->isValid()) return Failure{fmt::format("{} can't be brought into {}", path, other.Name())};
      way = [there](std::span<double> pairs) {
        there->apply(pairs);
        return Outcome();
      };
    }
    ElevationSampler opened;
    opened.sampler_ = std::make_unique<RasterSampler>(**raster, landValue, std::move(way));
    opened.raster_ = std::move(*raster);
    return opened;
  }

  Outcome sampleRows(const RasterPlace& grid, int columns, std::size_t firstRow, std::span<float> values) {
    return sampler_->sampleRows(grid, columns, static_cast<int>(firstRow), values);
  }

 private:
  ElevationSampler() = default;

  std::unique_ptr<Raster> raster_;
  std::unique_ptr<RasterSampler> sampler_;
};

// Where the points of a grid lie in its own projection; nothing where that can't hold them.
std::optional<RasterPlace> rasterPlaceOf(const ResampledGrid& grid) {
  RasterPlace place{{grid.location.firstX, grid.location.firstY}, {grid.dx, 0}, {0, grid.dy}};
  if (CVdMapProjection::IsLocal(grid.location.projection)) return place;
  const CVdCartography directions({}, 0, 0, grid.location.rotation);
  directions.Xy2Proj(grid.dx, 0, &place.nextColumn[0], &place.nextColumn[1]);
  directions.Xy2Proj(0, grid.dy, &place.nextRow[0], &place.nextRow[1]);
  if (!CVdMapProjection(grid.location.projection)
           .Geo2Proj(grid.location.longitude, grid.location.latitude, &place.first[0], &place.first[1]))
    return std::nullopt;
  return place;
}

Result<float> landIn(const std::string& path) {
  const Result<TsbFile> file = openGrid(path);
  if (!file) return Failure{file.error()};
  const Result<std::optional<float>> land = landValueOf(file->definition());
  if (!land) return Failure{land.error()};
  return land->value_or(std::numeric_limits<float>::quiet_NaN());
}

}  // namespace

Outcome makeFile(const PlacedGrid& making, const std::string& from, const std::string& to,
                 const FileProgress& progress) {
  const auto define = [&](TsbDefinition& file) {
    if (making.location) setLocation(file, *making.location);
  };
  const auto change = [&](const TsbDefinition& file, const auto& rows) -> Outcome {
    if (!making.hotStart || rows.item != 1 || rows.first != 0) return {};
    if (file.axes[0].points <= kOriginKPlace) return Failure{fmt::format("{} is no hot start file", from)};
    using Number = typename std::decay_t<decltype(rows.values)>::value_type;
    rows.values[kEnclosingPlace] = static_cast<Number>(making.hotStart->enclosing);
    rows.values[kOriginJPlace] = static_cast<Number>(making.hotStart->origin.j);
    rows.values[kOriginKPlace] = static_cast<Number>(making.hotStart->origin.k);
    return {};
  };
  return copyGrid(from, to, progress, "place of the grid set", define, change);
}

Outcome makeFile(const LandValueGrid& making, const std::string& from, const std::string& to,
                 const FileProgress& progress) {
  const Result<float> old = landIn(from);
  if (!old) return Failure{old.error()};
  const auto change = [&](const TsbDefinition&, const auto& rows) -> Outcome {
    if (rows.item != making.item || !(*old < making.landValue)) return {};
    for (auto& value : rows.values) {
      if (static_cast<float>(value) == *old) value = making.landValue;
    }
    return {};
  };
  return copyGrid(
      from, to, progress, fmt::format("land value set to {:g}", making.landValue),
      [&](TsbDefinition& file) { setLandValue(file, making.landValue); }, change);
}

Outcome makeFile(const TurnedGrid& making, const std::string& from, const std::string& to,
                 const FileProgress& progress) {
  const Result<float> land = landIn(from);
  if (!land) return Failure{land.error()};
  const auto change = [&](const TsbDefinition& file, const auto& rows) -> Outcome {
    if (rows.item != making.item) return {};
    for (auto& value : rows.values) {
      // What lies at the land value is no depth.
      if (!isMissing(value, file.items[rows.item - 1]) && static_cast<float>(value) != *land) value = -value;
    }
    return {};
  };
  return copyGrid(
      from, to, progress, "depths turned to elevations", [](TsbDefinition&) {}, change);
}

Outcome makeFile(const ResampledGrid& making, const std::string& fromPath, const std::string& toPath,
                 const FileProgress& progress) {
  const Result<TsbFile> from = openGrid(fromPath);
  if (!from) return Failure{from.error()};
  const Result<float> land = landIn(fromPath);
  if (!land) return Failure{land.error()};
  const Result<float> landAround = landIn(making.around);
  if (!landAround) return Failure{landAround.error()};
  const std::optional<RasterPlace> place = rasterPlaceOf(making);
  if (!place)
    return Failure{
        fmt::format("{} can't hold the grid", CVdMapProjection(making.location.projection).Name())};
  Result<ElevationSampler> around =
      ElevationSampler::open(making.around, 1, 0, *landAround, making.location.projection);
  if (!around) return Failure{around.error()};

  TsbDefinition definition = from->definition();
  definition.history = historyWith(definition.history, fmt::format("points that nest in {}", making.around));
  setLocation(definition, making.location);
  definition.axes[0].spacing = making.dx;
  definition.axes[1].spacing = making.dy;
  definition.axes[0].unit = definition.axes[1].unit = "m";
  const int columns = static_cast<int>(definition.axes[0].points);
  std::optional<ElevationSampler> own;
  std::vector<float> values;
  std::vector<float> behind;
  return writeGrid(toPath, definition, progress, [&](const auto& rows) -> Outcome {
    const bool isElevation = rows.item == 1;
    constexpr float kNone = std::numeric_limits<float>::quiet_NaN();
    if (rows.first == 0) {
      Result<ElevationSampler> opened = ElevationSampler::open(
          fromPath, rows.item, rows.step, isElevation ? *land : kNone, making.location.projection);
      if (!opened) return Failure{opened.error()};
      own = std::move(*opened);
    }
    values.resize(rows.values.size());
    if (Outcome done = own->sampleRows(*place, columns, rows.first, values); !done) return done;
    const auto isNone = [](float value) { return !std::isfinite(value); };
    if (isElevation && std::ranges::any_of(values, isNone)) {
      behind.resize(values.size());
      if (Outcome done = around->sampleRows(*place, columns, rows.first, behind); !done) return done;
      // What is land around it is land in it.
      for (std::size_t i = 0; i < values.size(); ++i) {
        if (isNone(values[i])) values[i] = behind[i] >= *landAround ? std::max(behind[i], *land) : behind[i];
      }
    }
    const double missing = definition.items[rows.item - 1].deleteValue;
    using Number = typename std::decay_t<decltype(rows.values)>::value_type;
    for (std::size_t i = 0; i < values.size(); ++i)
      rows.values[i] = static_cast<Number>(isNone(values[i]) ? missing : double{values[i]});
    return {};
  });
}

}  // namespace gridbay
