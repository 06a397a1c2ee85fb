#pragma once

#include <optional>
#include <span>
#include <string>

namespace gridbay::cli {

// A raster file of any kind, first band. Rows are those of the file, columns run along x.
class Raster {
 public:
  virtual ~Raster() = default;

  virtual int columns() const = 0;
  virtual int rows() const = 0;
  // The centre of the point in row 0 and column 0, and the steps to the next column and the next row.
  virtual double firstX() const = 0;
  virtual double firstY() const = 0;
  virtual double stepX() const = 0;
  virtual double stepY() const = 0;
  // False for a raster that is turned on the map or does not say where it lies.
  virtual bool isTurned() const = 0;
  virtual bool hasPlace() const = 0;
  virtual bool isInDegrees() const = 0;
  // The projection's full text; empty when the file has none.
  virtual std::string projection() const = 0;
  virtual std::optional<double> missingValue() const = 0;
  // Rows firstRow to firstRow + n - 1, n being what the span holds; false with the reason when they can't be
  // read.
  virtual bool read(int firstRow, std::span<float> values, std::string* error) = 0;
};

// The entry point of the raster module: a new raster that the caller owns, or null with the reason.
inline constexpr const char* kOpenRaster = "gridbayOpenRaster";
using OpenRaster = Raster* (*)(const char* path, std::string* error);

}  // namespace gridbay::cli
