#pragma once

#include <array>
#include <optional>
#include <string>
#include <vector>

#include "conversion/raster_conversion.h"

namespace gridbay {

// A raster as a conversion would bring it to a grid, at no more points than a screen shows.
struct RasterPreview {
  int columns = 0;  // of the picture
  int rows = 0;
  std::vector<float> values;  // along J first, K northwards; not-a-number for what is missing

  std::array<int, 2> points{};      // of the grid, along J and K
  std::array<double, 2> first{};    // what its axes begin at
  std::array<double, 2> spacing{};  // between its points
  double rotation = 0;              // degrees clockwise
  bool hasPlace = false;
  bool isOfPoints = false;
  bool isOwnMap = false;       // a data file of ours, which keeps its item type
  std::string unit;            // of the place where it is not metres
  std::string projection;      // its full text; empty for none
  std::string projectionName;  // for people
  std::string itemType;        // its name, where the file tells
  std::string valueUnit;
  std::optional<float> landValue;
  // Longitude and latitude (degrees) of its middle, where it lies on the earth.
  std::optional<std::array<double, 2>> middle;
  std::vector<std::string> bands;
  std::vector<std::string> rasters;  // in the file; with several of them and none chosen there is no picture

  // Each value of the picture is one of the grid's.
  bool isWhole() const { return columns == points[0] && rows == points[1]; }
};

// Reads the preview of a conversion, of which land value, missing values, extent and what is written are of
// no meaning here, at `most` points along an axis.
Result<RasterPreview> previewRaster(const RasterConversion& conversion, int most, ConversionHost& host);

}  // namespace gridbay
