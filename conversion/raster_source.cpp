#include "conversion/raster_source.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

#include "conversion/point_file.h"
#include "conversion/raster_reader.h"
#include "conversion/tsb_raster.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/grid_mapping.h"
#include "platform/cartography/transformation.h"
#include "platform/projection_search.h"

namespace gridbay {
namespace {

// Texts with their numbers, a line each; of a long list the beginning.
template <class TextOf>
std::string numbered(int count, const TextOf& textOf) {
  constexpr int kMost = 30;
  std::string list;
  for (int number = 1; number <= std::min(count, kMost); ++number)
    list += fmt::format("\n  {}  {}", number, textOf(number));
  if (count > kMost) list += fmt::format("\n  and {} more", count - kMost);
  return list;
}

// Opens the raster and chooses what the options ask for; says what else there would be.
Result<std::unique_ptr<Raster>> openRaster(const RasterConversion& options, ConversionHost& host) {
  Result<std::unique_ptr<Raster>> opened = openAnyRaster(options.in, options.subdataset);
  if (!opened) return opened;
  const std::vector<std::string> others = (*opened)->subdatasets();
  const int otherCount = static_cast<int>(others.size());
  const std::string list =
      numbered(otherCount, [&others](int number) { return others[static_cast<std::size_t>(number) - 1]; });
  if (options.subdataset > otherCount) {
    return Failure{
        otherCount == 0
            ? fmt::format("\"{}\" holds one raster only: leave {} out", options.in, host.option("subdataset"))
            : fmt::format("\"{}\" has no raster {}. It holds{}", options.in, options.subdataset, list)};
  }
  if ((*opened)->bands() == 0) {
    if (otherCount != 1)
      return Failure{fmt::format("\"{}\" holds several rasters; choose one with {}:{}", options.in,
                                 host.option("subdataset", "N"), list)};
    opened = openAnyRaster(options.in, 1);
    if (!opened) return opened;
  } else if (options.subdataset == 0 && otherCount > 1) {
    host.note(fmt::format("The file holds several rasters, of which {} takes another:{}",
                          host.option("subdataset", "N"), list));
  }
  Raster& raster = **opened;
  const auto bands = [&raster] {
    return numbered(raster.bands(), [&raster](int band) { return raster.bandName(band); });
  };
  if (options.band && *options.band > raster.bands()) {
    return Failure{
        fmt::format("The raster has no band {}. It has {}:{}", *options.band, raster.bands(), bands())};
  }
  if (!options.band && raster.bands() > 1) {
    host.note(fmt::format("The raster has {} bands, of which the first is taken; {} takes another:{}",
                          raster.bands(), host.option("band", "N"), bands()));
  }
  raster.choose(options.band.value_or(1));
  return opened;
}

// The full text of a projection in metres that a user names.
Result<std::string> projectionInMetres(const std::string& text) {
  const CVdMapProjection map(text);
  if (!map.IsValid() || map.IsLocal()) return Failure{unknownProjection(text)};
  if (Outcome metres = checkMetres(map); !metres) return Failure{metres.error()};
  return map.Wkt2();
}

// The full text of the projection that the options give to what names none, or another one.
Result<std::string> projectionOf(const RasterConversion& options) {
  if (options.crs.empty()) return std::string();
  const CVdMapProjection own(options.crs);
  if (own.IsValid()) return own.Wkt2();
  return Failure{unknownProjection(options.crs)};
}

// The raster brought to another projection or spacing, as the options ask.
Result<std::unique_ptr<Raster>> warpedRaster(const RasterConversion& options, Raster& raster,
                                             const ConversionHost& host) {
  WarpTarget target{.spacing = options.resample.value_or(0), .resampling = options.resampling};
  if (!options.reproject.empty()) {
    const Result<std::string> projection = projectionInMetres(options.reproject);
    if (!projection) return Failure{projection.error()};
    target.projection = *projection;
  }
  const Result<std::string> own = projectionOf(options);
  if (!own) return Failure{own.error()};
  target.from = *own;
  const bool hasProjection = !own->empty() || !CVdMapProjection(raster.projection()).IsLocal();
  if (!target.projection.empty() && !hasProjection) {
    return Failure{fmt::format("\"{}\" does not say in which projection it is: say so with {}", options.in,
                               host.option("crs", "CRS"))};
  }
  if (isTsbRaster(options.in)) {
    // A short name is not known to the raster library.
    if (target.from.empty()) target.from = CVdMapProjection(raster.projection()).Wkt2();
    // Land stays land. Where more of it is to be sea, what is said of it counts.
    target.land = raster.landValue();
    if (target.land && options.land && *options.land > *target.land) target.land.reset();
    return warpRaster(raster, target);
  }
  // A file that holds one raster only, inside of others, has that as its first.
  const int subdataset = options.subdataset == 0 && raster.bands() == 0 ? 1 : options.subdataset;
  Result<std::unique_ptr<Raster>> warped = openWarpedRaster(options.in, subdataset, target);
  if (warped) (*warped)->choose(options.band.value_or(1));
  return warped;
}

// The digits of a number that are easy to say: 1, 2 or 5 and zeros, the nearest below.
double plainNumber(double number) {
  const double unit = std::pow(10, std::floor(std::log10(number)));
  for (const double digit : {5.0, 2.0}) {
    if (number >= digit * unit) return digit * unit;
  }
  return unit;
}

Outcome reproject(PointSet& points, const std::string& from, const std::string& to) {
  std::vector<double> pairs(2 * points.x.size());
  for (std::size_t i = 0; i < points.x.size(); ++i) {
    pairs[2 * i] = points.x[i];
    pairs[2 * i + 1] = points.y[i];
  }
  if (!Transformation(from, to).apply(pairs)) return Failure{"There is no way between the two projections"};
  for (std::size_t i = 0; i < points.x.size(); ++i) {
    if (!std::isfinite(pairs[2 * i] + pairs[2 * i + 1])) {
      return Failure{fmt::format("The point {:.10g}, {:.10g} can't be brought to the projection", points.x[i],
                                 points.y[i])};
    }
    points.x[i] = pairs[2 * i];
    points.y[i] = pairs[2 * i + 1];
  }
  return {};
}

Result<std::unique_ptr<Raster>> griddedPoints(const RasterConversion& options, ConversionHost& host,
                                              bool guessSpacing) {
  constexpr std::size_t kParts = 1000;
  const auto progress = [&host](double done) {
    return done >= 1 || host.reached(static_cast<std::size_t>(done * kParts), kParts);
  };
  Result<PointSet> points = readPoints(options.in, progress);
  if (!points) return Failure{points.error()};
  if (!host.reached(kParts, kParts)) return Failure{std::string(kConversionStopped)};
  const Result<std::string> own = projectionOf(options);
  if (!own) return Failure{own.error()};
  std::string projection = *own;
  if (!options.reproject.empty()) {
    const Result<std::string> wanted = projectionInMetres(options.reproject);
    if (!wanted) return Failure{wanted.error()};
    if (own->empty()) {
      return Failure{fmt::format("The points do not say in which projection they are: say so with {}",
                                 host.option("crs", "CRS"))};
    }
    if (const Outcome done = reproject(*points, *own, *wanted); !done) return Failure{done.error()};
    projection = *wanted;
  }
  const Result<std::string> inMetres = projection.empty() ? projection : projectionInMetres(projection);
  if (!inMetres && !guessSpacing) return Failure{inMetres.error()};
  const double distance = points->meanDistance();
  if (points->areInLine()) return Failure{"The points lie on one line"};
  if (!options.resample && !guessSpacing) {
    return Failure{fmt::format("Points need the spacing of a grid: {} (they lie about {:.2g} apart)",
                               host.option("resample", "DX"), distance)};
  }
  constexpr double kReach = 3;  // mean distances, and spacings
  const double spacing = options.resample.value_or(plainNumber(distance));
  return gridPoints({.x = std::move(points->x),
                     .y = std::move(points->y),
                     .z = std::move(points->z),
                     .projection = projection,
                     .unit = inMetres ? "" : "degrees",
                     .spacing = spacing,
                     .reach = kReach * std::max(distance, spacing),
                     .gridding = options.gridding.value_or(Gridding::linear)});
}

}  // namespace

std::string unknownProjection(const std::string& text) {
  constexpr std::size_t kMost = 3;
  std::string words = fmt::format("\"{}\" is no projection that is known here", text);
  std::string_view between = "; known are ";
  for (const KnownProjection& near : findProjections(text, kMost)) {
    words += fmt::format("{}{} ({})", between, near.code, near.name);
    between = ", ";
  }
  return words;
}

Outcome checkMetres(const CVdMapProjection& projection) {
  const std::string wanted = "a grid wants a projection in metres";
  if (const auto mapping = gridMappingOf(projection.Wkt2()); mapping && mapping->name == kGeographicMapping)
    return Failure{fmt::format("\"{}\" is in degrees: {}", projection.Name(), wanted)};
  if (const double metres = projection.MetresPerUnit(); std::abs(metres - 1) > 1e-9)
    return Failure{fmt::format("\"{}\" has a unit of {:.6g} m: {}", projection.Name(), metres, wanted)};
  return {};
}

Result<RasterSource> openRasterSource(const RasterConversion& options, ConversionHost& host,
                                      bool guessSpacing) {
  const auto fromPoints = [&]() -> Result<RasterSource> {
    Result<std::unique_ptr<Raster>> grid = griddedPoints(options, host, guessSpacing);
    if (!grid) return Failure{grid.error()};
    return RasterSource{std::move(*grid), true};
  };
  if (options.gridding) return fromPoints();
  Result<std::unique_ptr<Raster>> opened = openRaster(options, host);
  if (!opened && !isTsbRaster(options.in)) {
    if (holdsPoints(options.in)) return fromPoints();
    if (holdsNumbers(options.in))
      return Failure{fmt::format(
          "\"{}\" is neither a raster nor a text of points, which has x, y and z on each line; {} "
          "takes it for one and says where it differs",
          options.in, host.option("gridding", "HOW"))};
  }
  if (opened && (!options.reproject.empty() || options.resample))
    opened = warpedRaster(options, **opened, host);
  if (!opened) return Failure{opened.error()};
  return RasterSource{std::move(*opened)};
}

}  // namespace gridbay
