#include <dlfcn.h>
#include <fmt/format.h>

#include <cmath>
#include <filesystem>
#include <memory>
#include <vector>

#include "cli/commands.h"
#include "cli/item_types.h"
#include "cli/output_file.h"
#include "cli/progress.h"
#include "cli/raster.h"
#include "cli/raster_layout.h"
#include "cli/tsb_raster.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/grid_mapping.h"
#include "platform/result.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay::cli {
namespace {

constexpr std::size_t kPointsAtOnce = 1 << 22;

struct Options {
  std::string in;
  std::string out;
  std::optional<float> land;
  std::optional<std::string> itemType;
  std::optional<int> band;
  int subdataset = 0;  // 0 for none
  std::optional<float> missingAs;
  std::string crs;
  std::optional<double> originX;
  std::optional<double> originY;
  int coarsen = 1;
  std::vector<int> window;  // j0, k0, j1, k1 of the raster with K northwards
  bool force = false;
};

// Which points of the raster become the grid: a window, and every so many of its points.
struct Selection {
  int firstJ;
  int firstK;
  int noJ;
  int noK;
  int every;
};

Result<std::unique_ptr<Raster>> openWithLibrary(const std::string& path, int subdataset) {
  std::error_code error;
  const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
  const std::string module = (program.parent_path() / "v27raster.so").string();
  void* library = ::dlopen(module.c_str(), RTLD_NOW | RTLD_LOCAL);
  void* entry = library == nullptr ? nullptr : ::dlsym(library, kOpenRaster);
  if (entry == nullptr)
    return Failure{fmt::format("The raster reader \"{}\" cannot be loaded: {}", module, ::dlerror())};
  std::string why;
  std::unique_ptr<Raster> raster(reinterpret_cast<OpenRaster>(entry)(path.c_str(), subdataset, &why));
  if (raster == nullptr) return Failure{fmt::format("cannot read \"{}\": {}", path, why)};
  return raster;
}

Result<std::unique_ptr<Raster>> openAny(const std::string& path, int subdataset) {
  return isTsbRaster(path) ? openTsbRaster(path, subdataset) : openWithLibrary(path, subdataset);
}

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
Result<std::unique_ptr<Raster>> openRaster(const Options& options, const Console& console) {
  Result<std::unique_ptr<Raster>> opened = openAny(options.in, options.subdataset);
  if (!opened) return opened;
  const std::vector<std::string> others = (*opened)->subdatasets();
  const int otherCount = static_cast<int>(others.size());
  const std::string list =
      numbered(otherCount, [&others](int number) { return others[static_cast<std::size_t>(number) - 1]; });
  if (options.subdataset > otherCount) {
    return Failure{
        otherCount == 0
            ? fmt::format("\"{}\" holds one raster only: leave --subdataset out", options.in)
            : fmt::format("\"{}\" has no raster {}. It holds{}", options.in, options.subdataset, list)};
  }
  if ((*opened)->bands() == 0) {
    if (otherCount != 1)
      return Failure{
          fmt::format("\"{}\" holds several rasters; choose one with --subdataset N:{}", options.in, list)};
    opened = openAny(options.in, 1);
    if (!opened) return opened;
  } else if (options.subdataset == 0 && otherCount > 1) {
    console.note(
        fmt::format("The file holds several rasters, of which --subdataset N takes another:{}", list));
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
    console.note(
        fmt::format("The raster has {} bands, of which the first is taken; --band N takes another:{}",
                    raster.bands(), bands()));
  }
  raster.choose(options.band.value_or(1));
  return opened;
}

Result<Selection> select(const Options& options, const Raster& raster) {
  Selection all{0, 0, raster.columns(), raster.rows(), options.coarsen};
  if (!options.window.empty()) {
    const int j0 = options.window[0];
    const int k0 = options.window[1];
    const int j1 = options.window[2];
    const int k1 = options.window[3];
    if (j0 < 0 || k0 < 0 || j1 < j0 || k1 < k0 || j1 >= raster.columns() || k1 >= raster.rows()) {
      return Failure{fmt::format("The window {},{},{},{} does not lie in the raster, which goes to {},{}", j0,
                                 k0, j1, k1, raster.columns() - 1, raster.rows() - 1)};
    }
    all = {j0, k0, j1 - j0 + 1, k1 - k0 + 1, options.coarsen};
  }
  all.noJ = (all.noJ - 1) / all.every + 1;
  all.noK = (all.noK - 1) / all.every + 1;
  return all;
}

// The grid to write, and where its first point lies.
struct Target {
  TsbDefinition definition;
  double east;
  double north;
};

Result<Target> define(const Options& options, const Raster& raster, const RasterLayout& layout,
                      const Selection& chosen, const Console& console) {
  const Result<const QunItem*> quantity = itemTypeOfText(
      options.itemType.value_or(std::to_string(raster.itemType().value_or(item::kBathymetry))));
  if (!quantity) return Failure{quantity.error()};
  if ((*quantity)->code == item::kBathymetry && !options.land)
    return Failure{"A bathymetry needs a land value: --land VALUE (points at or above it are land)"};
  const std::string_view baseUnit = qunBaseUnit((*quantity)->code)->text;
  if (const CVdUnitConverter converter(raster.unit(), baseUnit);
      !raster.unit().empty() &&
      !(converter.IsValid() && converter.Convert(0) == 0 && converter.Convert(1) == 1)) {
    return Failure{fmt::format("The values are in {}, and those of {} are to be in {}", raster.unit(),
                               (*quantity)->name, baseUnit)};
  }
  const std::string projection = options.crs.empty() ? raster.projection() : options.crs;
  const CVdMapProjection map(projection);
  if (!map.IsValid()) return Failure{fmt::format("\"{}\" is no projection that is known here", projection)};
  if (const auto mapping = gridMappingOf(map.Wkt2()); mapping && mapping->name == kGeographicMapping)
    return Failure{fmt::format("\"{}\" is in degrees: a grid wants a projection in metres", map.Name())};

  const std::array<double, 2> first = layout.at(chosen.firstJ, chosen.firstK);
  Target target{{}, options.originX.value_or(first[0]), options.originY.value_or(first[1])};
  TsbDefinition& definition = target.definition;
  definition.title = std::filesystem::path(options.in).stem().string();
  definition.history = historyWith(raster.history(), console);
  definition.time.type = TsbTimeAxisType::relativeEquidistant;
  const bool isTurned = layout.rotation != 0;
  definition.axes = {
      {static_cast<std::size_t>(chosen.noJ), isTurned ? 0 : target.east, layout.dx * chosen.every, "m"},
      {static_cast<std::size_t>(chosen.noK), isTurned ? 0 : target.north, layout.dy * chosen.every, "m"}};
  definition.items = {{std::string((*quantity)->name), (*quantity)->code, std::string(baseUnit)}};
  if (options.land) definition.customBlocks = {{"V27_Misc", {0, 0, 0, *options.land}}};
  if (map.IsLocal()) {
    if (isTurned) {
      console.note(fmt::format(
          "The raster is turned by {:g} degrees, which a grid without a projection (--crs) cannot tell",
          layout.rotation));
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

// Copies the chosen points, some rows at a time; returns how many values were missing.
Result<std::size_t> copyValues(const Options& options, Raster& raster, const RasterLayout& layout,
                               const Selection& chosen, TsbWriter& writer, const Console& console) {
  const auto columns = static_cast<std::size_t>(raster.columns());
  const int rowsAtOnce = static_cast<int>(std::max<std::size_t>(kPointsAtOnce / columns, 1));
  const std::optional<float> missingAs = options.missingAs ? options.missingAs : options.land;
  const std::optional<double> missing = raster.missingValue();
  const auto isMissing = [&missing](float value) {
    return !std::isfinite(value) || (missing && value == static_cast<float>(*missing));
  };
  Progress progress(console, "Converting", static_cast<std::size_t>(chosen.noK));
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
        return Failure{
            fmt::format("\"{}\" has missing values: say what stands for them with --nodata-as", options.in)};
      }
      row[static_cast<std::size_t>(j)] = gone ? *missingAs : value;
    }
    if (const Outcome written = writer.writeRows(1, 0, static_cast<std::size_t>(k), row); !written) {
      return Failure{written.error()};
    }
    progress.reached(static_cast<std::size_t>(k) + 1);
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

int convertRaster(const Options& options, const Console& console) {
  if (const Outcome free = mayWrite(options.out, options.force, {&options.in, 1}); !free)
    return console.fail(free.error());
  const Result<std::unique_ptr<Raster>> opened = openRaster(options, console);
  if (!opened) return console.fail(opened.error());
  Raster& raster = **opened;
  if (const Outcome free = mayWrite(options.out, options.force, filesIn(raster.files())); !free)
    return console.fail(free.error());
  if (const std::string unit = raster.otherUnit(); !unit.empty() && options.crs.empty()) {
    return console.fail(fmt::format(
        "The raster is in {}. Bring it to a projection in metres first, as with gdalwarp -t_srs", unit));
  }
  if (!raster.hasPlace())
    console.note("The raster does not say where it lies: its points are taken 1 m apart");
  const Result<RasterLayout> layout = layoutOf(raster.place(), raster.columns(), raster.rows());
  if (!layout) return console.fail(layout.error());
  const Result<Selection> chosen = select(options, raster);
  if (!chosen) return console.fail(chosen.error());
  const Result<Target> target = define(options, raster, *layout, *chosen, console);
  if (!target) return console.fail(target.error());
  Result<TsbWriter> writer = TsbWriter::create(options.out, target->definition);
  if (!writer) return console.fail(writer.error());
  const Result<std::size_t> missing = copyValues(options, raster, *layout, *chosen, *writer, console);
  if (!missing) return console.fail(missing.error());
  if (const Outcome written = writer->commit(); !written) return console.fail(written.error());

  const TsbGridAxis& x = target->definition.axes[0];
  const TsbGridAxis& y = target->definition.axes[1];
  const std::optional<TsbGeography>& place = target->definition.geography;
  console.out << fmt::format(
      "{}: {} x {} points, {:.6g} x {:.6g} m apart, from {:.10g}, {:.10g}{}{}\n", options.out, x.points,
      y.points, x.spacing, y.spacing, target->east, target->north,
      place && place->isTurned() ? fmt::format(", turned {:g} degrees clockwise", place->rotation) : "",
      options.land ? fmt::format("; land at {:g}", *options.land) : "");
  if (*missing > 0) {
    console.out << fmt::format("{} missing values written as {:g}\n", *missing,
                               options.missingAs ? *options.missingAs : *options.land);
  }
  return kClean;
}

}  // namespace

void addConvertRaster(CLI::App& convert, Action& action) {
  std::shared_ptr<Options> options;
  CLI::App& command = addCommand(convert, action, "raster", "Makes a map (tsb2) from a raster of any kind",
                                 convertRaster, options);
  command
      .add_option("IN", options->in,
                  "The raster: a file, or a name of the raster library (NETCDF:file:variable)")
      ->required();
  command.add_option("OUT", options->out, "The map to write (*.tsb2), rows turned so that K runs north")
      ->required();
  command
      .add_option("--land", options->land,
                  "Points at or above this value are land (unit of the values, at least 0); a bathymetry "
                  "needs it")
      ->check(finite(0));
  addItemType(command, options->itemType,
              "the values, which are in its base unit (default: as the file says, or else Bathymetry)");
  command.add_option("--band", options->band, "Number of the band to take, from 1 (default: the first)")
      ->check(CLI::PositiveNumber);
  command
      .add_option(
          "--subdataset", options->subdataset,
          "Number of the raster to take, from 1, in a file that holds several; without it they are listed")
      ->check(CLI::PositiveNumber);
  command
      .add_option("--nodata-as", options->missingAs,
                  "What stands for missing values (unit of the values; default: the land value)")
      ->check(finite());
  command.add_option("--crs", options->crs,
                     "The projection, as EPSG:28356, UTM-32 or a full text (default: the raster's own)");
  command
      .add_option("--origin-x", options->originX,
                  "Easting of the first point written (m; default: as the raster lies)")
      ->check(finite());
  command
      .add_option("--origin-y", options->originY,
                  "Northing of the first point written (m; default: as the raster lies)")
      ->check(finite());
  command.add_option("--coarsen", options->coarsen, "Take every N-th point")
      ->check(CLI::Range(1, 1000000))
      ->capture_default_str();
  command
      .add_option(
          "--window", options->window,
          "j0,k0,j1,k1: only these points, both ends counted, from 0, K from the south (default: all)")
      ->delimiter(',')
      ->expected(4);
  addForce(command, options->force);
}

}  // namespace gridbay::cli
