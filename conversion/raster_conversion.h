#pragma once

#include <array>
#include <map>
#include <optional>
#include <string>

#include "conversion/conversion_host.h"
#include "conversion/raster.h"
#include "platform/result.h"

namespace gridbay {

// Which raster is to become which map, and how.
struct RasterConversion {
  std::string in;   // a file of points or a raster, or a name of the raster library (NETCDF:file:variable)
  std::string out;  // the map (*.tsb2), rows turned so that K runs north
  std::optional<float> land;  // points at or above it are land; a bathymetry needs it (unit of the values)
  std::optional<std::string> itemType;  // by code, name or beginning of one; else the file's, or Bathymetry
  std::optional<int> band;              // from 1; else the first
  int subdataset = 0;                   // of a file that holds several rasters, from 1; 0 for none
  std::optional<float> missingAs;       // stands for missing values (unit of the values); else the land value
  std::string crs;                      // as EPSG:28356, UTM-32 or a full text; empty for the raster's own
  std::string reproject;                // the projection to bring it to; empty for its own
  std::optional<double> resample;       // the spacing to bring it to (m), else its own; points need one
  Resampling resampling = Resampling::bilinear;
  std::optional<Gridding> gridding;  // the file is one of points; else it is where it is no raster
  std::optional<double> originX;     // easting and northing of the first point (m), else as it lies
  std::optional<double> originY;
  int coarsen = 1;                           // every so many points, at least 1
  std::optional<std::array<int, 4>> window;  // j0, k0, j1, k1, from 0, both ends counted, K from the south
  // Only points within: least easting and northing, greatest easting and northing, in the projection of the
  // map; of a map that is turned along its own axes (m).
  std::optional<std::array<double, 4>> extent;
  bool force = false;   // replaces a file that is there
  std::string history;  // how the map came about, a line of its history without the date
};

// What a user calls them: "bilinear", "idw".
const std::map<std::string, Resampling>& resamplingNames();
const std::map<std::string, Gridding>& griddingNames();

// The map that was written.
struct ConvertedRaster {
  std::array<int, 2> points{};      // along J and K
  std::array<double, 2> spacing{};  // m
  std::array<double, 2> first{};    // easting and northing of the first point (m)
  double rotation = 0;              // degrees clockwise
  std::size_t missing = 0;          // values that were missing
  std::string summary;              // the same for people, a line or two
};

// Makes a map from a raster of any kind. An error leaves what is at the path as it was.
Result<ConvertedRaster> convertRaster(const RasterConversion& conversion, ConversionHost& host);

}  // namespace gridbay
