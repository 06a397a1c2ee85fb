#include <array>

#include "cli/commands.h"
#include "cli/console_conversion.h"
#include "conversion/raster_conversion.h"

namespace gridbay::cli {
namespace {

struct Options {
  RasterConversion conversion;
  std::vector<int> window;  // of four numbers, or none
};

int doConvert(const Options& options, const Console& console) {
  RasterConversion conversion = options.conversion;
  if (!options.window.empty())
    conversion.window = {options.window[0], options.window[1], options.window[2], options.window[3]};
  return convertWith(convertRaster, std::move(conversion), console);
}

}  // namespace

void addConvertRaster(CLI::App& convert, Action& action) {
  std::shared_ptr<Options> given;
  CLI::App& command =
      addCommand(convert, action, "raster", "Makes a map (tsb2) from a raster of any kind", doConvert, given);
  RasterConversion* options = &given->conversion;
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
  command.add_option("--reproject", options->reproject,
                     "The projection to bring the raster to, in metres, as EPSG:28356 or UTM-32");
  command
      .add_option("--resample", options->resample,
                  "The spacing to bring the raster to (m): interpolated, or means of what the points cover")
      ->check(CLI::PositiveNumber & finite());
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
          "--window", given->window,
          "j0,k0,j1,k1: only these points, both ends counted, from 0, K from the south (default: all)")
      ->delimiter(',')
      ->expected(4);
  addForce(command, options->force);
}

}  // namespace gridbay::cli
