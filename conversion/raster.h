#pragma once

#include <array>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace gridbay {

// Where a raster's points lie, eastwards and northwards in its projection: the centre of the point in row 0
// and column 0, and the steps from there to the next column and to the next row.
struct RasterPlace {
  std::array<double, 2> first{};
  std::array<double, 2> nextColumn{1, 0};
  std::array<double, 2> nextRow{0, 1};
};

// A raster file of any kind, or one of the rasters in it. Rows are those of the file. Bands count from 1.
class Raster {
 public:
  virtual ~Raster() = default;

  // None where the file only holds other rasters.
  virtual int bands() const = 0;
  // What a band holds, as far as the file tells.
  virtual std::string bandName(int band) const = 0;
  // What each of the further rasters in the file holds, in the order of their numbers (from 1).
  virtual std::vector<std::string> subdatasets() const = 0;
  // The files that it is read from, by their paths or by names of the raster library that have them in.
  virtual std::vector<std::string> files() const = 0;
  // How the file came about, and of what item type and unit its values are, where it tells.
  virtual std::string history() const { return {}; }
  virtual std::optional<int> itemType() const { return {}; }
  virtual std::string unit() const { return {}; }
  // Takes a band; the first until then. It must be there, here and in all that follows.
  virtual void choose(int band) = 0;

  virtual int columns() const = 0;
  virtual int rows() const = 0;
  virtual RasterPlace place() const = 0;
  virtual bool hasPlace() const = 0;
  // The unit of the place where it is not metres, as "degrees"; else empty.
  virtual std::string otherUnit() const = 0;
  // The projection's full text; empty when the file has none.
  virtual std::string projection() const = 0;
  virtual std::optional<double> missingValue() const = 0;
  // From where on its values are land, where the file tells.
  virtual std::optional<float> landValue() const { return {}; }
  // How many points are best read at once.
  virtual std::size_t pointsAtOnce() const { return std::size_t{1} << 20; }
  // Rows firstRow to firstRow + n - 1, n being what the span holds; false with the reason when they can't be
  // read.
  virtual bool read(int firstRow, std::span<float> values, std::string* error) = 0;
  // All of it at fewer points, each the nearest one to its part of the raster.
  virtual bool readWhole(int columnCount, int rowCount, std::span<float> values, std::string* error) = 0;
};

// The entry point of the raster module: a new raster that the caller owns, or null with the reason. With a
// `subdataset` (from 1, 0 for none) that of the rasters in the file.
inline constexpr const char* kOpenRaster = "gridbayOpenRaster";
using OpenRaster = Raster* (*)(const char* path, int subdataset, std::string* error);

// How values at other points come from those of a raster. All but the nearest one interpolate between closer
// points; the least and the greatest are those of all that a wider point covers.
enum class Resampling { bilinear, nearest, cubic, mean, least, greatest };

// The grid that a raster is brought to.
struct WarpTarget {
  std::string projection{};  // its full text; empty for the raster's own
  double spacing = 0;        // in its unit; 0 for one like the raster's
  RasterPlace place{};       // with a number of columns and rows, else the grid covers all of the raster
  int columns = 0;
  int rows = 0;
  std::string from{};  // the raster's own projection where it names none, or another one
  Resampling resampling = Resampling::bilinear;
  std::optional<float>
      land{};  // values at or above it are taken for missing, so that none spreads to the sea
};
inline constexpr const char* kOpenWarped = "gridbayOpenWarped";
using OpenWarped = Raster* (*)(const char* path, int subdataset, const WarpTarget* target,
                               std::string* error);
// The same of the chosen band of a raster, which is read at once.
inline constexpr const char* kWarpRaster = "gridbayWarpRaster";
using WarpRaster = Raster* (*)(Raster* raster, const WarpTarget* target, std::string* error);

// How a grid comes from points that lie anywhere: between the three around it, as the nearest one, or as the
// mean of near ones by the inverse square of their distance. The first and the last leave out what has no
// points around it, or near it.
enum class Gridding { linear, nearest, inverseDistance };

// Points that become a grid, northwards up, at whole multiples of its spacing.
struct PointGrid {
  std::vector<double> x;  // eastings or longitudes
  std::vector<double> y;
  std::vector<double> z;
  std::string projection;  // its full text; empty for none
  std::string unit;        // of the coordinates where it is not metres
  double spacing = 1;
  double reach = 0;  // how far off a point counts, by distance
  Gridding gridding = Gridding::linear;
};
// A raster that is worked out as it is read; it takes the points.
inline constexpr const char* kGridPoints = "gridbayGridPoints";
using GridPoints = Raster* (*)(PointGrid* points, std::string* error);

}  // namespace gridbay
