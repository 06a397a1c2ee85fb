#include <cpl_conv.h>
#include <cpl_error.h>
#include <cpl_string.h>
#include <gdal.h>
#include <gdalwarper.h>
#include <ogr_srs_api.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <memory>

#include "conversion/gdal_files.h"
#include "conversion/raster.h"

namespace gridbay {
namespace {

Dataset open(const char* path) {
  CPLErrorReset();
  return Dataset(
      GDALOpenEx(path, GDAL_OF_RASTER | GDAL_OF_READONLY | GDAL_OF_VERBOSE_ERROR, nullptr, nullptr, nullptr));
}

// Entry `what` (NAME or DESC) of a raster in the file, from 1; null when there is none.
const char* subdatasetEntry(GDALDatasetH dataset, int number, const char* what) {
  const std::string key = "SUBDATASET_" + std::to_string(number) + "_" + what;
  // The list as a whole: some formats make it only when it is asked for.
  return CSLFetchNameValue(GDALGetMetadata(dataset, "SUBDATASETS"), key.c_str());
}

class GdalRaster final : public Raster {
 public:
  GdalRaster(Dataset dataset, std::vector<std::string> subdatasets, Dataset source = nullptr)
      : source_(std::move(source)), dataset_(std::move(dataset)), subdatasets_(std::move(subdatasets)) {
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
    const GDALDatasetH read = source_ ? source_.get() : dataset_.get();
    const std::unique_ptr<char*, FreeTexts> list(GDALGetFileList(read));
    std::vector<std::string> names{GDALGetDescription(read)};
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
  // What is worked out takes a while for each point.
  std::size_t pointsAtOnce() const override { return std::size_t{1} << (source_ ? 16 : 20); }

  bool read(int firstRow, std::span<float> values, std::string* error) override {
    const int count = static_cast<int>(values.size() / static_cast<std::size_t>(columns()));
    CPLErrorReset();
    if (GDALRasterIO(band_, GF_Read, 0, firstRow, columns(), count, values.data(), columns(), count,
                     GDT_Float32, 0, 0) != CE_None) {
      *error = CPLGetLastErrorMsg();
      return false;
    }
    scale(values);
    return true;
  }
  bool readWhole(int columnCount, int rowCount, std::span<float> values, std::string* error) override {
    CPLErrorReset();
    if (GDALRasterIO(band_, GF_Read, 0, 0, columns(), rows(), values.data(), columnCount, rowCount,
                     GDT_Float32, 0, 0) != CE_None) {
      *error = CPLGetLastErrorMsg();
      return false;
    }
    scale(values);
    return true;
  }

 private:
  void scale(std::span<float> values) const {
    if (scale_ == 1 && offset_ == 0) return;
    for (float& value : values) {
      if (!missing_ || value != static_cast<float>(*missing_))
        value = static_cast<float>(value * scale_ + offset_);
    }
  }

  Dataset source_;  // that a data set worked out from it reads, up to its own end; else null
  Dataset dataset_;
  std::vector<std::string> subdatasets_;
  GDALRasterBandH band_ = nullptr;
  double transform_[6] = {0, 1, 0, 0, 0, 1};
  bool hasPlace_ = false;
  std::optional<double> missing_;
  double scale_ = 1;
  double offset_ = 0;
};

// A raster of the file with what else it holds; null with the reason.
struct Opened {
  Dataset dataset;
  std::vector<std::string> subdatasets;
};

Opened openFile(const char* path, int subdataset, std::string* error) {
  GDALAllRegister();
  CPLSetErrorHandler(CPLQuietErrorHandler);
  Opened file{open(path), {}};
  if (file.dataset) {
    for (int n = 1; const char* name = subdatasetEntry(file.dataset.get(), n, "NAME"); ++n) {
      const char* description = subdatasetEntry(file.dataset.get(), n, "DESC");
      file.subdatasets.push_back(std::string(description == nullptr ? "" : description) + " (" + name + ")");
    }
    const char* chosen = subdataset == 0 ? nullptr : subdatasetEntry(file.dataset.get(), subdataset, "NAME");
    if (chosen != nullptr) file.dataset = open(std::string(chosen).c_str());
  }
  if (!file.dataset ||
      (GDALGetRasterCount(file.dataset.get()) < 1 && (file.subdatasets.empty() || subdataset != 0))) {
    *error = CPLGetLastErrorMsg();
    if (error->empty()) *error = "it has no raster band";
    file.dataset.reset();
  }
  return file;
}

struct FreeWarpOptions {
  void operator()(GDALWarpOptions* options) const { GDALDestroyWarpOptions(options); }
};

// A data set that is worked out from another one as it is read. Points that the raster does not reach are
// missing.
class Warp {
 public:
  // Null with the reason.
  static Dataset of(GDALDatasetH source, const WarpTarget& target, std::string* error) {
    CPLErrorReset();
    double transform[6] = {0, 1, 0, 0, 0, 1};
    if (GDALGetGeoTransform(source, transform) != CE_None) {
      *error = "it does not say where it lies, so that it can't be brought to another grid";
      return nullptr;
    }
    const std::string own = target.from.empty() ? projectionOf(source) : target.from;
    const std::string wanted = target.projection.empty() ? own : target.projection;
    if (own.empty() && !target.projection.empty()) {
      *error = "it does not say in which projection it is";
      return nullptr;
    }
    int columns = target.columns;
    int rows = target.rows;
    if (columns > 0) {
      const RasterPlace& at = target.place;
      transform[1] = at.nextColumn[0];
      transform[2] = at.nextRow[0];
      transform[4] = at.nextColumn[1];
      transform[5] = at.nextRow[1];
      transform[0] = at.first[0] - transform[1] / 2 - transform[2] / 2;
      transform[3] = at.first[1] - transform[4] / 2 - transform[5] / 2;
    } else if (!cover(source, own, wanted, target.spacing, transform, &columns, &rows)) {
      return failed(error);
    }
    void* way = transformer(source, own, wanted);
    if (way == nullptr) return failed(error);
    GDALSetGenImgProjTransformerDstGeoTransform(way, transform);
    const std::unique_ptr<GDALWarpOptions, FreeWarpOptions> options(optionsFor(source));
    options->eResampleAlg = algorithmOf(target.resampling);
    options->hSrcDS = source;
    options->pfnTransformer = GDALGenImgProjTransform;
    options->pTransformerArg = way;  // which the new data set owns
    Dataset warped(GDALCreateWarpedVRT(source, columns, rows, transform, options.get()));
    if (!warped) {
      GDALDestroyGenImgProjTransformer(way);
      return failed(error);
    }
    GDALSetProjection(warped.get(), wanted.c_str());
    for (int band = 1; band <= GDALGetRasterCount(warped.get()); ++band) {
      const GDALRasterBandH from = GDALGetRasterBand(source, band);
      const GDALRasterBandH to = GDALGetRasterBand(warped.get(), band);
      GDALSetRasterNoDataValue(to, options->padfDstNoDataReal[band - 1]);
      GDALSetRasterScale(to, GDALGetRasterScale(from, nullptr));
      GDALSetRasterOffset(to, GDALGetRasterOffset(from, nullptr));
      GDALSetDescription(to, GDALGetDescription(from));
    }
    return warped;
  }

 private:
  static Dataset failed(std::string* error) {
    *error = CPLGetLastErrorMsg();
    if (error->empty()) *error = "it can't be brought to that grid";
    return nullptr;
  }
  // Interpolation becomes means where the new points lie wider; other ways to values of all that they cover
  // become interpolation where they lie closer.
  static GDALResampleAlg algorithmOf(Resampling resampling) {
    switch (resampling) {
      case Resampling::nearest:
        return GRA_NearestNeighbour;
      case Resampling::cubic:
        return GRA_Cubic;
      case Resampling::mean:
        return GRA_Average;
      case Resampling::least:
        return GRA_Min;
      case Resampling::greatest:
        return GRA_Max;
      case Resampling::bilinear:
        break;
    }
    return GRA_Bilinear;
  }
  static std::string projectionOf(GDALDatasetH source) {
    const char* text = GDALGetProjectionRef(source);
    return text == nullptr ? "" : text;
  }
  static void* transformer(GDALDatasetH source, const std::string& own, const std::string& projection) {
    char** texts = CSLSetNameValue(nullptr, "DST_SRS", projection.c_str());
    texts = CSLSetNameValue(texts, "SRC_SRS", own.c_str());
    const std::unique_ptr<char*, FreeTexts> settings(texts);
    return GDALCreateGenImgProjTransformer2(source, nullptr, projection.empty() ? nullptr : settings.get());
  }
  // A grid northwards up, at whole multiples of its spacing. Its points are those that lie in the raster:
  // beyond its edge there would be a border of nothing.
  static bool cover(GDALDatasetH source, const std::string& own, const std::string& projection,
                    double spacing, double* transform, int* columns, int* rows) {
    void* way = transformer(source, own, projection);
    if (way == nullptr) return false;
    double extent[4] = {};
    const CPLErr done =
        GDALSuggestedWarpOutput2(source, GDALGenImgProjTransform, way, transform, columns, rows, extent, 0);
    GDALDestroyGenImgProjTransformer(way);
    if (done != CE_None) return false;
    if (!(spacing > 0)) return true;
    constexpr double kInside = 1e-6;  // of a spacing
    const auto firstBeyond = [=](double edge) { return std::ceil(edge / spacing - 0.5 + kInside); };
    const auto lastBefore = [=](double edge) { return std::floor(edge / spacing - 0.5 - kInside); };
    const double west = firstBeyond(extent[0]) * spacing;
    const double north = (lastBefore(extent[3]) + 1) * spacing;
    const double across = std::max(lastBefore(extent[2]) - firstBeyond(extent[0]) + 1, 1.0);
    const double down = std::max(lastBefore(extent[3]) - firstBeyond(extent[1]) + 1, 1.0);
    constexpr double kMost = 1e6;  // columns or rows
    if (!(across >= 1 && down >= 1 && across <= kMost && down <= kMost)) {
      CPLError(CE_Failure, CPLE_AppDefined, "points %g apart would be %g x %g of them", spacing, across,
               down);
      return false;
    }
    *columns = static_cast<int>(across);
    *rows = static_cast<int>(down);
    const double north_up[6] = {west, spacing, 0, north, 0, -spacing};
    std::copy(std::begin(north_up), std::end(north_up), transform);
    return true;
  }
  static GDALWarpOptions* optionsFor(GDALDatasetH source) {
    constexpr double kMissing = -1e35;
    const int bands = GDALGetRasterCount(source);
    GDALWarpOptions* options = GDALCreateWarpOptions();
    options->eWorkingDataType = GDT_Float32;
    GDALWarpInitDefaultBandMapping(options, bands);
    GDALWarpInitSrcNoDataReal(options, kMissing);
    GDALWarpInitDstNoDataReal(options, kMissing);
    for (int band = 1; band <= bands; ++band) {
      int given = 0;
      const double missing = GDALGetRasterNoDataValue(GDALGetRasterBand(source, band), &given);
      if (given == 0) continue;
      options->padfSrcNoDataReal[band - 1] = missing;
      options->padfDstNoDataReal[band - 1] = missing;
    }
    options->papszWarpOptions = CSLSetNameValue(options->papszWarpOptions, "INIT_DEST", "NO_DATA");
    options->papszWarpOptions = CSLSetNameValue(options->papszWarpOptions, "UNIFIED_SRC_NODATA", "NO");
    return options;
  }
};

}  // namespace
}  // namespace gridbay

extern "C" gridbay::Raster* gridbayWarpRaster(gridbay::Raster* raster, const gridbay::WarpTarget* target,
                                              std::string* error) {
  gridbay::Dataset memory = gridbay::inMemory(*raster, target->land, error);
  if (!memory) return nullptr;
  gridbay::Dataset warped = gridbay::Warp::of(memory.get(), *target, error);
  if (!warped) return nullptr;
  return std::make_unique<gridbay::GdalRaster>(std::move(warped), std::vector<std::string>(),
                                               std::move(memory))
      .release();
}

extern "C" gridbay::Raster* gridbayOpenRaster(const char* path, int subdataset, std::string* error) {
  gridbay::Opened file = gridbay::openFile(path, subdataset, error);
  if (!file.dataset) return nullptr;
  return std::make_unique<gridbay::GdalRaster>(std::move(file.dataset), std::move(file.subdatasets))
      .release();
}

extern "C" gridbay::Raster* gridbayOpenWarped(const char* path, int subdataset,
                                              const gridbay::WarpTarget* target, std::string* error) {
  gridbay::Opened file = gridbay::openFile(path, subdataset, error);
  if (!file.dataset) return nullptr;
  if (GDALGetRasterCount(file.dataset.get()) < 1) {
    *error = "it holds several rasters, of which one must be chosen";
    return nullptr;
  }
  gridbay::Dataset warped = gridbay::Warp::of(file.dataset.get(), *target, error);
  if (!warped) return nullptr;
  return std::make_unique<gridbay::GdalRaster>(std::move(warped), std::move(file.subdatasets),
                                               std::move(file.dataset))
      .release();
}
