#include <dlfcn.h>
#include <fmt/format.h>

#include <cmath>
#include <filesystem>
#include <memory>
#include <vector>

#include "cli/commands.h"
#include "cli/progress.h"
#include "cli/raster.h"
#include "core/grid_point.h"
#include "platform/cartography/cartography.h"
#include "platform/result.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay::cli {
namespace {

constexpr std::size_t kPointsAtOnce = 1 << 22;

struct Options {
  std::string in;
  std::string out;
  float land = 0;
  int itemType = item::kBathymetry;
  std::optional<float> missingAs;
  std::string crs;
  std::optional<double> originX;
  std::optional<double> originY;
  int coarsen = 1;
  std::vector<int> window;  // j0, k0, j1, k1 of the raster with K northwards
};

// Which points of the raster become the grid: a window, and every so many of its points.
struct Selection {
  int firstJ;
  int firstK;
  int noJ;
  int noK;
  int every;
};

Result<std::unique_ptr<Raster>> openRaster(const std::string& path) {
  std::error_code error;
  const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
  const std::string module = (program.parent_path() / "v27raster.so").string();
  void* library = ::dlopen(module.c_str(), RTLD_NOW | RTLD_LOCAL);
  void* entry = library == nullptr ? nullptr : ::dlsym(library, kOpenRaster);
  if (entry == nullptr)
    return Failure{fmt::format("The raster reader \"{}\" cannot be loaded: {}", module, ::dlerror())};
  std::string why;
  std::unique_ptr<Raster> raster(reinterpret_cast<OpenRaster>(entry)(path.c_str(), &why));
  if (raster == nullptr) return Failure{fmt::format("cannot read \"{}\": {}", path, why)};
  return raster;
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

// Rows of the raster count from its first one; K counts from the southernmost.
int rowOf(const Raster& raster, int k) {
  return raster.stepY() < 0 ? raster.rows() - 1 - k : k;
}

Result<TsbDefinition> define(const Options& options, const Raster& raster, const Selection& chosen) {
  const QunItem* quantity = qunFindItem(options.itemType);
  if (quantity == nullptr) return Failure{fmt::format("There is no item type {}", options.itemType)};
  const std::string projection = options.crs.empty() ? raster.projection() : options.crs;
  const CVdMapProjection map(projection);
  if (!map.IsValid()) return Failure{fmt::format("\"{}\" is no projection that is known here", projection)};

  const double dx = std::abs(raster.stepX());
  const double dy = std::abs(raster.stepY());
  const double south =
      raster.stepY() < 0 ? raster.firstY() + (raster.rows() - 1) * raster.stepY() : raster.firstY();
  TsbDefinition definition;
  definition.title = std::filesystem::path(options.in).stem().string();
  definition.time.type = TsbTimeAxisType::relativeEquidistant;
  definition.axes = {{static_cast<std::size_t>(chosen.noJ),
                      options.originX.value_or(raster.firstX() + chosen.firstJ * dx), dx * chosen.every, "m"},
                     {static_cast<std::size_t>(chosen.noK),
                      options.originY.value_or(south + chosen.firstK * dy), dy * chosen.every, "m"}};
  definition.items = {
      {std::string(quantity->name), quantity->code, std::string(qunBaseUnit(quantity->code)->text)}};
  definition.customBlocks = {{"V27_Misc", {0, 0, 0, options.land}}};
  if (!map.IsLocal()) {
    TsbGeography place{projection, 0, 0, 0};
    if (!map.Proj2Geo(definition.axes[0].first, definition.axes[1].first, &place.longitude,
                      &place.latitude)) {
      return Failure{fmt::format("The point {}, {} does not lie in the projection \"{}\"",
                                 definition.axes[0].first, definition.axes[1].first, map.Name())};
    }
    definition.geography = place;
  }
  return definition;
}

// Copies the chosen points, some rows at a time; returns how many values were missing.
Result<std::size_t> copyValues(const Options& options, Raster& raster, const Selection& chosen,
                               TsbWriter& writer, const Console& console) {
  const auto columns = static_cast<std::size_t>(raster.columns());
  const int rowsAtOnce = static_cast<int>(std::max<std::size_t>(kPointsAtOnce / columns, 1));
  const float missingAs = options.missingAs.value_or(options.land);
  const std::optional<double> missing = raster.missingValue();
  const auto isMissing = [&missing](float value) {
    return std::isnan(value) || (missing && value == static_cast<float>(*missing));
  };
  Progress progress(console, "Converting", static_cast<std::size_t>(chosen.noK));
  std::size_t missingCount = 0;
  std::vector<float> block;
  std::vector<float> row(static_cast<std::size_t>(chosen.noJ));
  int blockFirst = 0;
  int blockCount = 0;
  for (int k = 0; k < chosen.noK; ++k) {
    const int wanted = rowOf(raster, chosen.firstK + k * chosen.every);
    if (wanted < blockFirst || wanted >= blockFirst + blockCount) {
      // The rows that come next: before this one where the raster runs southwards.
      blockFirst = raster.stepY() < 0 ? std::max(wanted - rowsAtOnce + 1, 0) : wanted;
      blockCount = std::min(rowsAtOnce, raster.rows() - blockFirst);
      block.resize(columns * static_cast<std::size_t>(blockCount));
      std::string why;
      if (!raster.read(blockFirst, block, &why))
        return Failure{fmt::format("cannot read \"{}\": {}", options.in, why)};
    }
    const float* source = block.data() + static_cast<std::size_t>(wanted - blockFirst) * columns;
    for (int j = 0; j < chosen.noJ; ++j) {
      const float value = source[chosen.firstJ + j * chosen.every];
      const bool gone = isMissing(value);
      missingCount += gone ? 1 : 0;
      row[static_cast<std::size_t>(j)] = gone ? missingAs : value;
    }
    if (const Outcome written = writer.writeRows(1, 0, static_cast<std::size_t>(k), row); !written) {
      return Failure{written.error()};
    }
    progress.reached(static_cast<std::size_t>(k) + 1);
  }
  return missingCount;
}

int convertRaster(const Options& options, const Console& console) {
  Result<std::unique_ptr<Raster>> raster = openRaster(options.in);
  if (!raster) return console.fail(raster.error());
  if ((*raster)->isTurned()) {
    return console.fail("The raster is turned on the map. Turn it north up first, as with gdalwarp");
  }
  if ((*raster)->isInDegrees() && options.crs.empty()) {
    return console.fail(
        "The raster is in degrees. Bring it to a projection in metres first, as with gdalwarp -t_srs");
  }
  if (!(*raster)->hasPlace())
    console.note("The raster does not say where it lies: its points are taken 1 m apart");
  const Result<Selection> chosen = select(options, **raster);
  if (!chosen) return console.fail(chosen.error());
  const Result<TsbDefinition> definition = define(options, **raster, *chosen);
  if (!definition) return console.fail(definition.error());
  Result<TsbWriter> writer = TsbWriter::create(options.out, *definition);
  if (!writer) return console.fail(writer.error());
  const Result<std::size_t> missing = copyValues(options, **raster, *chosen, *writer, console);
  if (!missing) return console.fail(missing.error());
  if (const Outcome written = writer->commit(); !written) return console.fail(written.error());

  const TsbGridAxis& x = definition->axes[0];
  const TsbGridAxis& y = definition->axes[1];
  console.out << fmt::format(
      "{}: {} x {} points, {:.6g} x {:.6g} m apart, from {:.10g}, {:.10g}; land at {:g}\n", options.out,
      x.points, y.points, x.spacing, y.spacing, x.first, y.first, options.land);
  if (*missing > 0) {
    console.out << fmt::format("{} missing values written as {:g}\n", *missing,
                               options.missingAs.value_or(options.land));
  }
  return kClean;
}

}  // namespace

void addConvertRaster(CLI::App& convert, Action& action) {
  std::shared_ptr<Options> options;
  CLI::App& command = addCommand(convert, action, "raster", "Makes a map (tsb2) from a raster of any kind",
                                 convertRaster, options);
  command.add_option("IN", options->in, "The raster; its first band is taken")->required();
  command.add_option("OUT", options->out, "The map to write (*.tsb2), rows turned so that K runs north")
      ->required();
  command.add_option("--land", options->land, "Points at or above this value are land")->required();
  command.add_option("--item-type", options->itemType, "Item code of the values")->capture_default_str();
  command.add_option("--nodata-as", options->missingAs,
                     "What stands for missing values (default: the land value)");
  command.add_option("--crs", options->crs,
                     "The projection, as EPSG:28356, UTM-32 or a full text, over the raster's own");
  command.add_option("--origin-x", options->originX, "Easting of the first point written (m)");
  command.add_option("--origin-y", options->originY, "Northing of the first point written (m)");
  command.add_option("--coarsen", options->coarsen, "Take every N-th point")
      ->check(CLI::Range(1, 1000000))
      ->capture_default_str();
  command
      .add_option("--window", options->window,
                  "j0,k0,j1,k1: only these points, both ends counted, K from the south")
      ->delimiter(',')
      ->expected(4);
}

}  // namespace gridbay::cli
