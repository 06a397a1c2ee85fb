#include <array>
#include <string>
#include <vector>

#include "cli/commands.h"
#include "cli/console_conversion.h"
#include "conversion/raster_conversion.h"

namespace gridbay::cli {
namespace {

struct RasterConversionOptions {
  RasterConversion conversion;
  std::vector<int> window;     // of four numbers, or none
  std::vector<double> extent;  // likewise
  std::string resampling = "bilinear";
  std::string gridding;  // empty for none
};

int doConvertRaster(const RasterConversionOptions& options, const Console& console) {
  RasterConversion conversion = options.conversion;
  if (!options.window.empty())
    conversion.window = {options.window[0], options.window[1], options.window[2], options.window[3]};
  if (!options.extent.empty())
    conversion.extent = {options.extent[0], options.extent[1], options.extent[2], options.extent[3]};
  conversion.resampling = resamplingNames().at(options.resampling);
  if (!options.gridding.empty()) conversion.gridding = griddingNames().at(options.gridding);
  return convertWith(convertRaster, std::move(conversion), console);
}

}  // namespace

void addConvertRaster(CLI::App& convert, Action& action) {
  std::shared_ptr<RasterConversionOptions> given;
  CLI::App& command = addCommand(convert, action, "raster", "Makes a map (tsb2) from a raster of any kind",
                                 doConvertRaster, given);
  RasterConversion* options = &given->conversion;
  command
      .add_option("IN", options->in,
                  "The raster: a file, or a name of the raster library (NETCDF:file:variable); or a text of "
                  "points, x y z on each line")
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
      ->check(finite(1));
  command
      .add_option(
          "--subdataset", options->subdataset,
          "Number of the raster to take, from 1, in a file that holds several; without it they are listed")
      ->check(finite(1));
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
                  "The spacing to bring the raster to (m); a text of points needs one")
      ->check(aboveZero());
  command
      .add_option(
          "--resampling", given->resampling,
          "How values of other points come from those of the raster; bilinear becomes means where points "
          "lie wider")
      ->check(CLI::IsMember(resamplingNames()))
      ->capture_default_str();
  command
      .add_option(
          "--gridding", given->gridding,
          "IN is a text of points, which become a grid in this way: between the three around each point, "
          "as the nearest one, or as means of near ones by the inverse square of their distance (default "
          "for what is no raster: linear)")
      ->check(CLI::IsMember(griddingNames()));
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
  command
      .add_option(
          "--extent", given->extent,
          "w,s,e,n: only points between these eastings and northings, in the projection of the map (m)")
      ->delimiter(',')
      ->check(finite())
      ->expected(4);
  addForce(command, options->force);
}

}  // namespace gridbay::cli
