#include <cpl_conv.h>
#include <cpl_error.h>
#include <cpl_string.h>
#include <gdal.h>
#include <ogr_srs_api.h>

#include <cmath>
#include <memory>

#include "conversion/raster.h"

namespace gridbay {
namespace {

struct CloseDataset {
  void operator()(GDALDatasetH dataset) const { GDALClose(dataset); }
};
using Dataset = std::unique_ptr<void, CloseDataset>;

struct FreeTexts {
  void operator()(char** texts) const { CSLDestroy(texts); }
};

Dataset open(const char* path) {
  CPLErrorReset();
  return Dataset(GDALOpenEx(path, GDAL_OF_RASTER | GDAL_OF_READONLY, nullptr, nullptr, nullptr));
}

// Entry `what` (NAME or DESC) of a raster in the file, from 1; null when there is none.
const char* subdatasetEntry(GDALDatasetH dataset, int number, const char* what) {
  const std::string key = "SUBDATASET_" + std::to_string(number) + "_" + what;
  // The list as a whole: some formats make it only when it is asked for.
  return CSLFetchNameValue(GDALGetMetadata(dataset, "SUBDATASETS"), key.c_str());
}

class GdalRaster final : public Raster {
 public:
  GdalRaster(Dataset dataset, std::vector<std::string> subdatasets)
      : dataset_(std::move(dataset)), subdatasets_(std::move(subdatasets)) {
    hasPlace_ = GDALGetGeoTransform(dataset_.get(), transform_) == CE_None;
    if (bands() > 0) choose(1);
  }

  int bands() const override { return GDALGetRasterCount(dataset_.get()); }
  std::string bandName(int band) const override {
    const GDALRasterBandH chosen = GDALGetRasterBand(dataset_.get(), band);
    const std::string text = GDALGetDescription(chosen);
    if (!text.empty()) return text;
    const GDALColorInterp colour = GDALGetRasterColorInterpretation(chosen);
    return colour == GCI_Undefined ? "" : GDALGetColorInterpretationName(colour);
  }
  std::vector<std::string> subdatasets() const override { return subdatasets_; }
  std::vector<std::string> files() const override {
    const std::unique_ptr<char*, FreeTexts> list(GDALGetFileList(dataset_.get()));
    std::vector<std::string> names{GDALGetDescription(dataset_.get())};
    for (char** name = list.get(); name != nullptr && *name != nullptr; ++name) names.emplace_back(*name);
    return names;
  }

  void choose(int band) override {
    band_ = GDALGetRasterBand(dataset_.get(), band);
    int given = 0;
    const double missing = GDALGetRasterNoDataValue(band_, &given);
    missing_ = given != 0 ? std::optional(missing) : std::nullopt;
    scale_ = GDALGetRasterScale(band_, nullptr);
    offset_ = GDALGetRasterOffset(band_, nullptr);
  }

  int columns() const override { return GDALGetRasterXSize(dataset_.get()); }
  int rows() const override { return GDALGetRasterYSize(dataset_.get()); }
  RasterPlace place() const override {
    return {{transform_[0] + transform_[1] / 2 + transform_[2] / 2,
             transform_[3] + transform_[4] / 2 + transform_[5] / 2},
            {transform_[1], transform_[4]},
            {transform_[2], transform_[5]}};
  }
  bool hasPlace() const override { return hasPlace_; }
  std::string otherUnit() const override {
    const OGRSpatialReferenceH reference = GDALGetSpatialRef(dataset_.get());
    if (reference == nullptr) return {};
    if (OSRIsGeographic(reference) != 0) return "degrees";
    char* name = nullptr;
    const double metres = OSRGetLinearUnits(reference, &name);
    return metres == 1 || OSRIsProjected(reference) == 0 ? "" : name;
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
  std::vector<std::string> subdatasets_;
  GDALRasterBandH band_ = nullptr;
  double transform_[6] = {0, 1, 0, 0, 0, 1};
  bool hasPlace_ = false;
  std::optional<double> missing_;
  double scale_ = 1;
  double offset_ = 0;
};

}  // namespace
}  // namespace gridbay

extern "C" gridbay::Raster* gridbayOpenRaster(const char* path, int subdataset, std::string* error) {
  using gridbay::subdatasetEntry;
  GDALAllRegister();
  CPLSetErrorHandler(CPLQuietErrorHandler);
  gridbay::Dataset dataset = gridbay::open(path);
  std::vector<std::string> others;
  if (dataset) {
    for (int n = 1; const char* name = subdatasetEntry(dataset.get(), n, "NAME"); ++n) {
      const char* description = subdatasetEntry(dataset.get(), n, "DESC");
      others.push_back(std::string(description == nullptr ? "" : description) + " (" + name + ")");
    }
    const char* chosen = subdataset == 0 ? nullptr : subdatasetEntry(dataset.get(), subdataset, "NAME");
    if (chosen != nullptr) dataset = gridbay::open(std::string(chosen).c_str());
  }
  if (!dataset || (GDALGetRasterCount(dataset.get()) < 1 && (others.empty() || subdataset != 0))) {
    *error = CPLGetLastErrorMsg();
    if (error->empty()) *error = "it has no raster band";
    return nullptr;
  }
  return std::make_unique<gridbay::GdalRaster>(std::move(dataset), std::move(others)).release();
}
