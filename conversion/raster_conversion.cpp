#include "conversion/raster_conversion.h"

#include <fmt/format.h>

#include <cmath>
#include <filesystem>
#include <memory>
#include <vector>

#include "conversion/history.h"
#include "conversion/item_types.h"
#include "conversion/raster_layout.h"
#include "conversion/raster_source.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/grid_mapping.h"
#include "platform/files/may_write.h"
#include "platform/projection_search.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

// What no raster could be converted with.
Outcome check(const RasterConversion& options, const ConversionHost& host) {
  const auto refuse = [&host](std::string_view name, const auto& given, std::string_view allowed) {
    return Failure{fmt::format("{} cannot be {}: {}", host.option(name), given, allowed)};
  };
  const auto isFinite = [](const auto& number) { return !number || std::isfinite(*number); };
  if (options.land && !(*options.land >= 0 && std::isfinite(*options.land)))
    return refuse("land", *options.land, "it is a number of at least 0");
  if (!isFinite(options.missingAs)) return refuse("nodata-as", *options.missingAs, "it is a finite number");
  if (!isFinite(options.originX)) return refuse("origin-x", *options.originX, "it is a finite number");
  if (!isFinite(options.originY)) return refuse("origin-y", *options.originY, "it is a finite number");
  if (options.band && *options.band < 1) return refuse("band", *options.band, "bands count from 1");
  if (options.subdataset < 0) return refuse("subdataset", options.subdataset, "rasters count from 1");
  if (options.resample && !(*options.resample > 0 && std::isfinite(*options.resample)))
    return refuse("resample", *options.resample, "it is a number of metres above 0");
  if (options.extent) {
    const auto [west, south, east, north] = *options.extent;
    // Also when one of them is no number.
    if (!(west <= east && south <= north && std::isfinite(east - west + north - south)))
      return refuse("extent", fmt::format("{:g},{:g},{:g},{:g}", west, south, east, north),
                    "it is the least easting and northing, and then the greatest");
    if (options.window)
      return Failure{
          fmt::format("{} and {} don't go together", host.option("window"), host.option("extent"))};
  }
  if (options.coarsen < 1) return refuse("coarsen", options.coarsen, "it is at least 1");
  return {};
}

// Which points of the raster become the grid: a window, and every so many of its points.
struct Selection {
  int firstJ;
  int firstK;
  int noJ;
  int noK;
  int every;
};

Result<Selection> select(const RasterConversion& options, const Raster& raster, const RasterLayout& layout) {
  Selection all{0, 0, raster.columns(), raster.rows(), options.coarsen};
  if (options.extent) {
    const auto [west, south, east, north] = *options.extent;
    const auto [x, y] = layout.axesFirst();
    const auto [j0, j1] = pointsBetween(west, east, x, layout.dx, raster.columns());
    const auto [k0, k1] = pointsBetween(south, north, y, layout.dy, raster.rows());
    if (j1 < j0 || k1 < k0) {
      return Failure{
          fmt::format("The extent {:.10g},{:.10g},{:.10g},{:.10g} holds no point of the raster, which "
                      "goes from {:.10g},{:.10g} to {:.10g},{:.10g}",
                      west, south, east, north, x, y, x + (raster.columns() - 1) * layout.dx,
                      y + (raster.rows() - 1) * layout.dy)};
    }
    all = {j0, k0, j1 - j0 + 1, k1 - k0 + 1, options.coarsen};
  }
  if (options.window) {
    const auto [j0, k0, j1, k1] = *options.window;
    if (j0 < 0 || k0 < 0 || j1 < j0 || k1 < k0 || j1 >= raster.columns() || k1 >= raster.rows()) {
      return Failure{fmt::format("The window {},{},{},{} does not lie in the raster, which goes to {},{}", j0,
                                 k0, j1, k1, raster.columns() - 1, raster.rows() - 1)};
    }
    all = {j0, k0, j1 - j0 + 1, k1 - k0 + 1, options.coarsen};
  }
  all.noJ = (all.noJ - 1) / all.every + 1;
  all.noK = (all.noK - 1) / all.every + 1;
  constexpr int kFewest = 2;
  const bool isCoarser = options.resample || options.coarsen > 1;
  if (isCoarser && (all.noJ < kFewest || all.noK < kFewest))
    return Failure{
        fmt::format("The grid would have {} x {} points, and wants {} x {} at least: closer ones, or a "
                    "larger part of the raster",
                    all.noJ, all.noK, kFewest, kFewest)};
  return all;
}

// The grid to write, and where its first point lies.
struct Target {
  TsbDefinition definition;
  double east;
  double north;
};

Result<Target> define(const RasterConversion& options, const Raster& raster, const RasterLayout& layout,
                      const Selection& chosen, ConversionHost& host) {
  const Result<const QunItem*> quantity =
      itemTypeOfText(options.itemType.value_or(std::to_string(raster.itemType().value_or(item::kBathymetry))),
                     host.itemTypeList());
  if (!quantity) return Failure{quantity.error()};
  if ((*quantity)->code == item::kBathymetry && !options.land)
    return Failure{fmt::format("A bathymetry needs a land value: {} (points at or above it are land)",
                               host.option("land", "VALUE"))};
  const std::string_view baseUnit = qunBaseUnit((*quantity)->code)->text;
  if (const CVdUnitConverter converter(raster.unit(), baseUnit);
      !raster.unit().empty() &&
      !(converter.IsValid() && converter.Convert(0) == 0 && converter.Convert(1) == 1)) {
    return Failure{fmt::format("The values are in {}, and those of {} are to be in {}", raster.unit(),
                               (*quantity)->name, baseUnit)};
  }
  const bool isOwn = options.crs.empty() || !options.reproject.empty();
  const std::string projection = isOwn ? raster.projection() : options.crs;
  const CVdMapProjection map(projection);
  if (!map.IsValid()) return Failure{unknownProjection(projection)};
  if (Outcome metres = checkMetres(map); !metres) return Failure{metres.error()};

  const std::array<double, 2> first = layout.at(chosen.firstJ, chosen.firstK);
  Target target{{}, options.originX.value_or(first[0]), options.originY.value_or(first[1])};
  TsbDefinition& definition = target.definition;
  definition.title = std::filesystem::path(options.in).stem().string();
  definition.history = historyWith(raster.history(), options.history);
  definition.time.type = TsbTimeAxisType::relativeEquidistant;
  const bool isTurned = layout.rotation != 0;
  definition.axes = {
      {static_cast<std::size_t>(chosen.noJ), isTurned ? 0 : target.east, layout.dx * chosen.every, "m"},
      {static_cast<std::size_t>(chosen.noK), isTurned ? 0 : target.north, layout.dy * chosen.every, "m"}};
  definition.items = {{std::string((*quantity)->name), (*quantity)->code, std::string(baseUnit)}};
  if (options.land) definition.customBlocks = {{"V27_Misc", {0, 0, 0, *options.land}}};
  if (map.IsLocal()) {
    if (isTurned) {
      host.note(fmt::format(
          "The raster is turned by {:g} degrees, which a grid without a projection ({}) cannot tell",
          layout.rotation, host.option("crs")));
    }
    return target;
  }
  TsbGeography place{projection, 0, 0, layout.rotation};
  if (!map.Proj2Geo(target.east, target.north, &place.longitude, &place.latitude)) {
    return Failure{fmt::format("The point {}, {} does not lie in the projection \"{}\"", target.east,
                               target.north, map.Name())};
  }
  definition.geography = place;
  return target;
}

// A northern zone of UTM in which all northings are below 0 was hardly meant.
void tellSouthernZone(const RasterConversion& options, const Target& target, ConversionHost& host) {
  if (options.reproject.empty()) return;
  const std::string zone = CVdMapProjection(options.reproject).Name();
  const TsbGridAxis& y = target.definition.axes[1];
  const double last = target.north + static_cast<double>(y.points - 1) * y.spacing;
  if (last >= 0 || zone.find("UTM zone") == zone.npos || !zone.ends_with('N')) return;
  const std::string southern = zone.substr(0, zone.size() - 1) + "S";
  const std::vector<KnownProjection> known = findProjections(southern, 1);
  host.note(
      fmt::format("The map lies south of the equator, from northing {:.0f} of \"{}\": its southern zone is "
                  "\"{}\"{}",
                  target.north, zone, southern, known.empty() ? "" : ", " + known.front().code));
}

// Before hours of work: what the disk has no room for.
Outcome checkRoom(const std::string& path, const TsbDefinition& map) {
  std::error_code unknown;
  const std::filesystem::path folder = std::filesystem::absolute(path, unknown).parent_path();
  const std::filesystem::space_info disk = std::filesystem::space(folder, unknown);
  const double wanted = static_cast<double>(sizeof(float)) * static_cast<double>(map.axes[0].points) *
                        static_cast<double>(map.axes[1].points);
  if (unknown || wanted <= static_cast<double>(disk.available)) return {};
  constexpr double kGigabyte = 1e9;
  return Failure{
      fmt::format("cannot write \"{}\": its {} x {} points take {:.3g} GB, and the disk has {:.3g} GB free",
                  path, map.axes[0].points, map.axes[1].points, wanted / kGigabyte,
                  static_cast<double>(disk.available) / kGigabyte)};
}

// Copies the chosen points, some rows at a time; returns how many values were missing.
Result<std::size_t> copyValues(const RasterConversion& options, Raster& raster, const RasterLayout& layout,
                               const Selection& chosen, TsbWriter& writer, ConversionHost& host) {
  const auto columns = static_cast<std::size_t>(raster.columns());
  const int rowsAtOnce = static_cast<int>(std::max<std::size_t>(raster.pointsAtOnce() / columns, 1));
  const std::optional<float> missingAs = options.missingAs ? options.missingAs : options.land;
  const std::optional<double> missing = raster.missingValue();
  const auto isMissing = [&missing](float value) {
    return !std::isfinite(value) || (missing && value == static_cast<float>(*missing));
  };
  std::size_t missingCount = 0;
  std::vector<float> block;
  std::vector<float> row(static_cast<std::size_t>(chosen.noJ));
  int blockFirst = 0;
  int blockCount = 0;
  for (int k = 0; k < chosen.noK; ++k) {
    const int wanted = layout.row(chosen.firstK + k * chosen.every);
    if (wanted < blockFirst || wanted >= blockFirst + blockCount) {
      // The rows that come next: before this one where the raster runs southwards.
      blockFirst = layout.rowsBackwards ? std::max(wanted - rowsAtOnce + 1, 0) : wanted;
      blockCount = std::min(rowsAtOnce, raster.rows() - blockFirst);
      block.resize(columns * static_cast<std::size_t>(blockCount));
      std::string why;
      if (!raster.read(blockFirst, block, &why))
        return Failure{fmt::format("cannot read \"{}\": {}", options.in, why)};
    }
    const float* source = block.data() + static_cast<std::size_t>(wanted - blockFirst) * columns;
    for (int j = 0; j < chosen.noJ; ++j) {
      const float value = source[layout.column(chosen.firstJ + j * chosen.every)];
      const bool gone = isMissing(value);
      missingCount += gone ? 1 : 0;
      if (gone && !missingAs) {
        return Failure{fmt::format("\"{}\" has missing values: say what stands for them with {}", options.in,
                                   host.option("nodata-as"))};
      }
      row[static_cast<std::size_t>(j)] = gone ? *missingAs : value;
    }
    if (const Outcome written = writer.writeRows(1, 0, static_cast<std::size_t>(k), row); !written) {
      return Failure{written.error()};
    }
    if (!host.reached(static_cast<std::size_t>(k) + 1, static_cast<std::size_t>(chosen.noK)))
      return Failure{std::string(kConversionStopped)};
  }
  return missingCount;
}

// The files that a name of the raster library may mean, as NETCDF:"a.nc":depth: all that stand between its
// colons and quotes.
std::vector<std::string> filesIn(const std::vector<std::string>& names) {
  std::vector<std::string> files;
  for (const std::string& name : names) {
    std::vector<std::size_t> ends{0};
    for (std::size_t i = 0; i < name.size(); ++i) {
      if (name[i] == ':' || name[i] == '"') ends.push_back(i + 1);
    }
    ends.push_back(name.size() + 1);
    for (std::size_t first = 0; first < ends.size(); ++first) {
      for (std::size_t last = first + 1; last < ends.size(); ++last)
        files.push_back(name.substr(ends[first], ends[last] - 1 - ends[first]));
    }
  }
  return files;
}

}  // namespace

const std::map<std::string, Resampling>& resamplingNames() {
  static const std::map<std::string, Resampling> names{
      {"bilinear", Resampling::bilinear}, {"nearest", Resampling::nearest},
      {"cubic", Resampling::cubic},       {"mean", Resampling::mean},
      {"least", Resampling::least},       {"greatest", Resampling::greatest}};
  return names;
}
const std::map<std::string, Gridding>& griddingNames() {
  static const std::map<std::string, Gridding> names{
      {"linear", Gridding::linear}, {"nearest", Gridding::nearest}, {"idw", Gridding::inverseDistance}};
  return names;
}

Result<ConvertedRaster> convertRaster(const RasterConversion& options, ConversionHost& host) {
  if (const Outcome fit = check(options, host); !fit) return Failure{fit.error()};
  if (const Outcome free = mayWrite(options.out, options.force, {&options.in, 1}, host.option("force"));
      !free)
    return Failure{free.error()};
  const Result<RasterSource> opened = openRasterSource(options, host);
  if (!opened) return Failure{opened.error()};
  Raster& raster = *opened->raster;
  if (const Outcome free =
          mayWrite(options.out, options.force, filesIn(raster.files()), host.option("force"));
      !free)
    return Failure{free.error()};
  if (const std::string unit = raster.otherUnit();
      !unit.empty() && (options.crs.empty() || !options.reproject.empty())) {
    return Failure{fmt::format("The raster is in {}. Bring it to a projection in metres with {}", unit,
                               host.option("reproject", "CRS"))};
  }
  if (!raster.hasPlace()) host.note("The raster does not say where it lies: its points are taken 1 m apart");
  const Result<RasterLayout> layout = layoutOf(raster.place(), raster.columns(), raster.rows());
  if (!layout) return Failure{layout.error()};
  const Result<Selection> chosen = select(options, raster, *layout);
  if (!chosen) return Failure{chosen.error()};
  const Result<Target> target = define(options, raster, *layout, *chosen, host);
  if (!target) return Failure{target.error()};
  tellSouthernZone(options, *target, host);
  if (const Outcome fits = checkRoom(options.out, target->definition); !fits) return Failure{fits.error()};
  Result<TsbWriter> writer = TsbWriter::create(options.out, target->definition);
  if (!writer) return Failure{writer.error()};
  const Result<std::size_t> missing = copyValues(options, raster, *layout, *chosen, *writer, host);
  if (!missing) return Failure{missing.error()};
  if (const Outcome written = writer->commit(); !written) return Failure{written.error()};

  const TsbGridAxis& x = target->definition.axes[0];
  const TsbGridAxis& y = target->definition.axes[1];
  const std::optional<TsbGeography>& place = target->definition.geography;
  ConvertedRaster converted{.points = {static_cast<int>(x.points), static_cast<int>(y.points)},
                            .spacing = {x.spacing, y.spacing},
                            .first = {target->east, target->north},
                            .rotation = place ? place->rotation : 0,
                            .missing = *missing,
                            .summary = {}};
  converted.summary = fmt::format(
      "{}: {} x {} points, {:.6g} x {:.6g} m apart, from {:.10g}, {:.10g}{}{}\n", options.out, x.points,
      y.points, x.spacing, y.spacing, target->east, target->north,
      place && place->isTurned() ? fmt::format(", turned {:g} degrees clockwise", place->rotation) : "",
      options.land ? fmt::format("; land at {:g}", *options.land) : "");
  if (*missing > 0) {
    converted.summary += fmt::format("{} missing values written as {:g}\n", *missing,
                                     options.missingAs ? *options.missingAs : *options.land);
  }
  return converted;
}

}  // namespace gridbay
