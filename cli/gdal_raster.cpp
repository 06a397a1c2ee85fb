#include <cpl_conv.h>
#include <cpl_error.h>
#include <gdal.h>
#include <ogr_srs_api.h>

#include <cmath>
#include <memory>

#include "cli/raster.h"

namespace gridbay::cli {
namespace {

struct CloseDataset {
  void operator()(GDALDatasetH dataset) const { GDALClose(dataset); }
};
using Dataset = std::unique_ptr<void, CloseDataset>;

class GdalRaster final : public Raster {
 public:
  explicit GdalRaster(Dataset dataset)
      : dataset_(std::move(dataset)), band_(GDALGetRasterBand(dataset_.get(), 1)) {
    hasPlace_ = GDALGetGeoTransform(dataset_.get(), transform_) == CE_None;
    int given = 0;
    const double missing = GDALGetRasterNoDataValue(band_, &given);
    if (given != 0) missing_ = missing;
    scale_ = GDALGetRasterScale(band_, nullptr);
    offset_ = GDALGetRasterOffset(band_, nullptr);
  }

  int columns() const override { return GDALGetRasterXSize(dataset_.get()); }
  int rows() const override { return GDALGetRasterYSize(dataset_.get()); }
  double firstX() const override { return transform_[0] + transform_[1] / 2; }
  double firstY() const override { return transform_[3] + transform_[5] / 2; }
  double stepX() const override { return transform_[1]; }
  double stepY() const override { return transform_[5]; }
  bool isTurned() const override { return transform_[2] != 0 || transform_[4] != 0; }
  bool hasPlace() const override { return hasPlace_; }
  bool isInDegrees() const override {
    const OGRSpatialReferenceH reference = GDALGetSpatialRef(dataset_.get());
    return reference != nullptr && OSRIsGeographic(reference) != 0;
  }
  std::string projection() const override {
    const char* text = GDALGetProjectionRef(dataset_.get());
    return text == nullptr ? "" : text;
  }
  std::optional<double> missingValue() const override { return missing_; }

  bool read(int firstRow, std::span<float> values, std::string* error) override {
    const int count = static_cast<int>(values.size() / static_cast<std::size_t>(columns()));
    CPLErrorReset();
    if (GDALRasterIO(band_, GF_Read, 0, firstRow, columns(), count, values.data(), columns(), count,
                     GDT_Float32, 0, 0) != CE_None) {
      *error = CPLGetLastErrorMsg();
      return false;
    }
    if (scale_ == 1 && offset_ == 0) return true;
    for (float& value : values) {
      if (!missing_ || value != static_cast<float>(*missing_))
        value = static_cast<float>(value * scale_ + offset_);
    }
    return true;
  }

 private:
  Dataset dataset_;
  GDALRasterBandH band_;
  double transform_[6] = {0, 1, 0, 0, 0, 1};
  bool hasPlace_ = false;
  std::optional<double> missing_;
  double scale_ = 1;
  double offset_ = 0;
};

}  // namespace
}  // namespace gridbay::cli

extern "C" gridbay::cli::Raster* gridbayOpenRaster(const char* path, std::string* error) {
  GDALAllRegister();
  CPLSetErrorHandler(CPLQuietErrorHandler);
  gridbay::cli::Dataset dataset(
      GDALOpenEx(path, GDAL_OF_RASTER | GDAL_OF_READONLY, nullptr, nullptr, nullptr));
  if (!dataset || GDALGetRasterCount(dataset.get()) < 1) {
    *error = CPLGetLastErrorMsg();
    if (error->empty()) *error = "it has no raster band";
    return nullptr;
  }
  return std::make_unique<gridbay::cli::GdalRaster>(std::move(dataset)).release();
}
