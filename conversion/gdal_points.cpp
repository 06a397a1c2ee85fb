#include <cpl_error.h>
#include <cpl_string.h>
#include <gdal.h>
#include <gdal_alg.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <memory>
#include <utility>

#include "conversion/raster.h"

namespace gridbay {
namespace {

constexpr double kMissing = -1e35;
constexpr double kMost = 1e6;  // columns or rows

struct FreeContext {
  void operator()(GDALGridContext* context) const { GDALGridContextFree(context); }
};
using Context = std::unique_ptr<GDALGridContext, FreeContext>;

Context contextOf(const PointGrid& points) {
  const auto count = static_cast<GUInt32>(points.x.size());
  const auto make = [&](GDALGridAlgorithm algorithm, const void* options) {
    return Context(GDALGridContextCreate(algorithm, options, count, points.x.data(), points.y.data(),
                                         points.z.data(), TRUE));
  };
  if (points.gridding == Gridding::nearest) {
    GDALGridNearestNeighborOptions options{};
    options.nSizeOfStructure = sizeof options;
    options.dfNoDataValue = kMissing;
    return make(GGA_NearestNeighbor, &options);
  }
  if (points.gridding == Gridding::inverseDistance) {
    GDALGridInverseDistanceToAPowerNearestNeighborOptions options{};
    options.nSizeOfStructure = sizeof options;
    options.dfPower = 2;
    options.dfRadius = points.reach;
    options.nMaxPoints = 12;
    options.nMinPoints = 1;
    options.dfNoDataValue = kMissing;
    return make(GGA_InverseDistanceToAPowerNearestNeighbor, &options);
  }
  GDALGridLinearOptions options{};
  options.nSizeOfStructure = sizeof options;
  options.dfNoDataValue = kMissing;
  return make(GGA_Linear, &options);
}

// A grid that is worked out from its points as it is read. Rows run northwards.
class PointRaster final : public Raster {
 public:
  // Coordinates are counted from the first grid point, so that the triangles lose no digits.
  PointRaster(PointGrid points, std::array<double, 2> first, int columns, int rows)
      : points_(std::move(points)), first_(first), columns_(columns), rows_(rows) {
    for (double& x : points_.x) x -= first_[0];
    for (double& y : points_.y) y -= first_[1];
    context_ = contextOf(points_);
  }
  bool isReady() const { return context_ != nullptr; }

  int bands() const override { return 1; }
  std::string bandName(int) const override { return {}; }
  std::vector<std::string> subdatasets() const override { return {}; }
  std::vector<std::string> files() const override { return {}; }
  void choose(int) override {}
  int columns() const override { return columns_; }
  int rows() const override { return rows_; }
  RasterPlace place() const override { return {first_, {points_.spacing, 0}, {0, points_.spacing}}; }
  bool hasPlace() const override { return true; }
  std::string otherUnit() const override { return points_.unit; }
  std::string projection() const override { return points_.projection; }
  std::optional<double> missingValue() const override { return kMissing; }
  std::size_t pointsAtOnce() const override { return std::size_t{1} << 16; }

  bool read(int firstRow, std::span<float> values, std::string* error) override {
    const int count = static_cast<int>(values.size() / static_cast<std::size_t>(columns_));
    return gridRows(firstRow, count, columns_, count, values, error);
  }
  bool readWhole(int columnCount, int rowCount, std::span<float> values, std::string* error) override {
    return gridRows(0, rows_, columnCount, rowCount, values, error);
  }

 private:
  bool gridRows(int firstRow, int count, int columnCount, int rowCount, std::span<float> values,
                std::string* error) {
    const double half = points_.spacing / 2;
    CPLErrorReset();
    if (GDALGridContextProcess(context_.get(), -half, (columns_ - 0.5) * points_.spacing,
                               firstRow * points_.spacing - half, (firstRow + count - 0.5) * points_.spacing,
                               static_cast<GUInt32>(columnCount), static_cast<GUInt32>(rowCount), GDT_Float32,
                               values.data(), nullptr, nullptr) == CE_None)
      return true;
    *error = CPLGetLastErrorMsg();
    return false;
  }

  PointGrid points_;
  std::array<double, 2> first_;
  int columns_;
  int rows_;
  Context context_;
};

// The multiples of a spacing between the least and the greatest coordinate: the first, and how many.
std::pair<double, double> multiplesIn(const std::vector<double>& coordinates, double spacing) {
  const auto [least, greatest] = std::ranges::minmax(coordinates);
  constexpr double kDigits = 1e-6;  // of the spacing, by which coordinates may be rounded
  const double first = std::ceil(least / spacing - kDigits);
  return {first * spacing, std::floor(greatest / spacing + kDigits) - first + 1};
}

}  // namespace
}  // namespace gridbay

extern "C" gridbay::Raster* gridbayGridPoints(gridbay::PointGrid* points, std::string* error) {
  using namespace gridbay;
  CPLSetErrorHandler(CPLQuietErrorHandler);
  CPLErrorReset();
  const auto [west, columns] = multiplesIn(points->x, points->spacing);
  const auto [south, rows] = multiplesIn(points->y, points->spacing);
  if (!(columns >= 2 && rows >= 2 && columns <= kMost && rows <= kMost) ||
      points->x.size() > std::numeric_limits<GUInt32>::max()) {
    *error = CPLSPrintf("at that spacing their extent has %g x %g points", columns, rows);
    return nullptr;
  }
  auto raster = std::make_unique<PointRaster>(std::move(*points), std::array{west, south},
                                              static_cast<int>(columns), static_cast<int>(rows));
  if (!raster->isReady()) {
    *error = CPLGetLastErrorMsg();
    if (error->empty()) *error = "no triangles can be made of them";
    return nullptr;
  }
  return raster.release();
}
