#include <cpl_conv.h>
#include <cpl_string.h>
#include <gdal.h>
#include <gdal_alg.h>
#include <ogr_api.h>
#include <ogr_srs_api.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <memory>

#include "conversion/background.h"
#include "conversion/gdal_files.h"

namespace gridbay {
namespace {

struct FreeReference {
  void operator()(OGRSpatialReferenceH reference) const { OSRDestroySpatialReference(reference); }
};
struct FreeWay {
  void operator()(OGRCoordinateTransformationH way) const { OCTDestroyCoordinateTransformation(way); }
};
struct FreeFeature {
  void operator()(OGRFeatureH feature) const { OGR_F_Destroy(feature); }
};
struct FreeTransformer {
  void operator()(void* way) const { GDALDestroyGenImgProjTransformer(way); }
};
struct FreeApproximation {
  void operator()(void* way) const { GDALDestroyApproxTransformer(way); }
};
using Reference = std::unique_ptr<std::remove_pointer_t<OGRSpatialReferenceH>, FreeReference>;
using Way = std::unique_ptr<std::remove_pointer_t<OGRCoordinateTransformationH>, FreeWay>;
using Feature = std::unique_ptr<std::remove_pointer_t<OGRFeatureH>, FreeFeature>;

constexpr const char* kNoProjection =
    "it names no projection, and is placed as if it were in that of the map";
constexpr const char* kLocalMap = "the map has no projection: it is placed by its own coordinates";

Reference referenceOf(const std::string& projection) {
  Reference reference(projection.empty() ? nullptr : OSRNewSpatialReference(projection.c_str()));
  if (reference) OSRSetAxisMappingStrategy(reference.get(), OAMS_TRADITIONAL_GIS_ORDER);
  return reference;
}

// A raster as a picture: three bands are red, green and blue, one has a table of colours or is grey.
class RasterBackground final : public Background {
 public:
  static std::unique_ptr<Background> open(OpenedFile file, const std::string& projection,
                                          std::string* error) {
    std::unique_ptr<RasterBackground> made(new RasterBackground(std::move(file)));
    if (!made->place(projection, error)) return nullptr;
    made->findColours();
    return made;
  }

  bool isRaster() const override { return true; }
  const std::string& notice() const override { return notice_; }
  const RasterNames& rasters() const override { return rasters_; }
  const std::vector<VectorLayer>& shapes() const override { return none_; }

  bool paint(const BackgroundFrame& frame, std::span<std::uint32_t> pixels,
             const std::function<bool()>& isCancelled, std::string* error) override {
    const QuietErrors quiet;
    std::ranges::fill(pixels, 0U);
    const std::vector<Place> places = placesOf(frame, isCancelled);
    if (places.empty()) return false;
    const Window window = windowOf(places, frame);
    if (window.columns < 1 || window.rows < 1) return true;
    if (!read(window, isCancelled, error)) return false;
    for (std::size_t i = 0; i < pixels.size(); ++i) {
      if (isInside(places[i])) pixels[i] = colourAt(window, places[i]);
    }
    return true;
  }

 private:
  // In pixels of the raster, from its upper left corner.
  struct Place {
    double x;
    double y;
  };
  // A part of the raster, and how many points of it are read.
  struct Window {
    int left = 0;
    int top = 0;
    int columns = 0;
    int rows = 0;
    int readColumns = 0;
    int readRows = 0;
  };

  explicit RasterBackground(OpenedFile file)
      : dataset_(std::move(file.dataset)), rasters_(std::move(file.rasters)) {}

  bool place(const std::string& projection, std::string* error) {
    if (!hasPlace(dataset_.get())) {
      *error = "it does not say where it lies";
      return false;
    }
    const bool isNamed =
        GDALGetSpatialRef(dataset_.get()) != nullptr || GDALGetGCPSpatialRef(dataset_.get()) != nullptr;
    if (projection.empty()) {
      if (isNamed) notice_ = kLocalMap;
    } else if (!isNamed) {
      notice_ = kNoProjection;
    }
    const std::unique_ptr<char*, FreeTexts> settings(
        projection.empty() || !isNamed ? nullptr : CSLSetNameValue(nullptr, "DST_SRS", projection.c_str()));
    way_.reset(GDALCreateGenImgProjTransformer2(dataset_.get(), nullptr, settings.get()));
    if (!way_) {
      *error = lastError("it can't be brought into the projection of the map");
      return false;
    }
    constexpr double kPart = 0.25;  // of a pixel of the raster
    quickWay_.reset(GDALCreateApproxTransformer(GDALGenImgProjTransform, way_.get(), kPart));
    return true;
  }

  void findColours() {
    for (int band = 1; band <= shownBands(dataset_.get()); ++band)
      bands_.push_back(GDALGetRasterBand(dataset_.get(), band));
    if (bands_.size() == 1) table_ = GDALGetRasterColorTable(bands_.front());
    if (table_ != nullptr || GDALGetRasterDataType(bands_.front()) == GDT_Byte) return;
    least_ = std::numeric_limits<double>::max();
    greatest_ = std::numeric_limits<double>::lowest();
    for (const GDALRasterBandH band : bands_) {
      double range[2] = {};
      GDALComputeRasterMinMax(band, TRUE, range);
      least_ = std::min(least_, range[0]);
      greatest_ = std::max(greatest_, range[1]);
    }
    if (!(greatest_ > least_)) greatest_ = least_ + 1;
  }

  // Of each pixel of a frame, not-a-number where the projection does not reach; empty when cancelled.
  std::vector<Place> placesOf(const BackgroundFrame& frame, const std::function<bool()>& isCancelled) const {
    const auto width = static_cast<std::size_t>(frame.width);
    std::vector<Place> places;
    places.reserve(width * static_cast<std::size_t>(frame.height));
    std::vector<double> x(width);
    std::vector<double> y(width);
    std::vector<double> z(width);
    std::vector<int> found(width);
    for (int row = 0; row < frame.height; ++row) {
      if (isCancelled()) return {};
      for (std::size_t i = 0; i < width; ++i)
        x[i] = frame.west + (static_cast<double>(i) + 0.5) * frame.metresPerPixel;
      std::ranges::fill(y, frame.north - (row + 0.5) * frame.metresPerPixel);
      std::ranges::fill(z, 0.0);
      std::ranges::fill(found, 0);
      GDALApproxTransform(quickWay_.get(), TRUE, frame.width, x.data(), y.data(), z.data(), found.data());
      constexpr double kNone = std::numeric_limits<double>::quiet_NaN();
      for (std::size_t i = 0; i < width; ++i)
        places.push_back(found[i] != 0 ? Place{x[i], y[i]} : Place{kNone, kNone});
    }
    return places;
  }

  bool isInside(const Place& at) const {
    return at.x >= 0 && at.y >= 0 && at.x < GDALGetRasterXSize(dataset_.get()) &&
           at.y < GDALGetRasterYSize(dataset_.get());
  }

  // No more points than four for each pixel of the frame are read.
  Window windowOf(const std::vector<Place>& places, const BackgroundFrame& frame) const {
    double left = std::numeric_limits<double>::max();
    double top = left;
    double right = -1;
    double bottom = -1;
    for (const Place& at : places) {
      if (!isInside(at)) continue;
      left = std::min(left, at.x);
      right = std::max(right, at.x);
      top = std::min(top, at.y);
      bottom = std::max(bottom, at.y);
    }
    if (right < left) return {};
    Window window{static_cast<int>(left), static_cast<int>(top)};
    window.columns = static_cast<int>(right) - window.left + 1;
    window.rows = static_cast<int>(bottom) - window.top + 1;
    constexpr double kMostPerPixel = 4;
    const double points = static_cast<double>(window.columns) * window.rows;
    const double step =
        std::max(1.0, std::sqrt(points / (kMostPerPixel * frame.width * static_cast<double>(frame.height))));
    window.readColumns = std::max(1, static_cast<int>(window.columns / step));
    window.readRows = std::max(1, static_cast<int>(window.rows / step));
    return window;
  }

  static int CPL_STDCALL goesOn(double, const char*, void* isCancelled) {
    return (*static_cast<const std::function<bool()>*>(isCancelled))() ? FALSE : TRUE;
  }

  bool read(const Window& window, const std::function<bool()>& isCancelled, std::string* error) {
    const std::size_t count =
        static_cast<std::size_t>(window.readColumns) * static_cast<std::size_t>(window.readRows);
    GDALRasterIOExtraArg extra;
    INIT_RASTERIO_EXTRA_ARG(extra);
    extra.pfnProgress = goesOn;
    extra.pProgressData = const_cast<std::function<bool()>*>(&isCancelled);
    const auto readBand = [&](GDALRasterBandH band, void* values, GDALDataType type) {
      if (GDALRasterIOEx(band, GF_Read, window.left, window.top, window.columns, window.rows, values,
                         window.readColumns, window.readRows, type, 0, 0, &extra) == CE_None)
        return true;
      if (!isCancelled()) *error = lastError("it can't be read");
      return false;
    };
    values_.resize(bands_.size());
    for (std::size_t i = 0; i < bands_.size(); ++i) {
      values_[i].resize(count);
      if (!readBand(bands_[i], values_[i].data(), GDT_Float32)) return false;
    }
    shown_.resize(count);
    return readBand(GDALGetMaskBand(bands_.front()), shown_.data(), GDT_Byte);
  }

  std::uint32_t colourAt(const Window& window, const Place& at) const {
    const auto along = [](double place, int first, int whole, int count) {
      return std::clamp(static_cast<int>((place - first) * count / whole), 0, count - 1);
    };
    const int column = along(at.x, window.left, window.columns, window.readColumns);
    const int row = along(at.y, window.top, window.rows, window.readRows);
    const std::size_t place = static_cast<std::size_t>(row) * static_cast<std::size_t>(window.readColumns) +
                              static_cast<std::size_t>(column);
    const std::uint32_t alpha = shown_[place];
    if (alpha == 0 || !std::isfinite(values_.front()[place])) return 0;
    const auto mixed = [](std::uint32_t a, std::uint32_t red, std::uint32_t green, std::uint32_t blue) {
      return a << 24U | red << 16U | green << 8U | blue;
    };
    if (table_ != nullptr) {
      GDALColorEntry entry{};
      const int index = static_cast<int>(values_.front()[place]);
      if (GDALGetColorEntryAsRGB(table_, index, &entry) == FALSE) return 0;
      const auto part = [](short value) {
        return static_cast<std::uint32_t>(std::clamp<int>(value, 0, 255));
      };
      return mixed(std::min(alpha, part(entry.c4)), part(entry.c1), part(entry.c2), part(entry.c3));
    }
    const auto level = [&](std::size_t band) {
      const double part = (values_[band][place] - least_) / (greatest_ - least_);
      return static_cast<std::uint32_t>(std::lround(std::clamp(part, 0.0, 1.0) * 255));
    };
    const bool isGrey = values_.size() == 1;
    return mixed(alpha, level(0), level(isGrey ? 0 : 1), level(isGrey ? 0 : 2));
  }

  Dataset dataset_;
  RasterNames rasters_;
  std::unique_ptr<void, FreeTransformer> way_;
  std::unique_ptr<void, FreeApproximation> quickWay_;
  std::vector<GDALRasterBandH> bands_;
  GDALColorTableH table_ = nullptr;
  double least_ = 0;
  double greatest_ = 255;
  std::string notice_;
  std::vector<VectorLayer> none_;
  std::vector<std::vector<float>> values_;  // that were read last, of each band
  std::vector<std::uint8_t> shown_;
};

// Points and lines of all layers of a file, read once.
class VectorBackground final : public Background {
 public:
  static std::unique_ptr<Background> open(const Dataset& dataset, const std::string& projection,
                                          const std::function<bool()>& isCancelled, std::string* error) {
    auto made = std::make_unique<VectorBackground>();
    const Reference map = referenceOf(projection);
    for (int i = 0; i < GDALDatasetGetLayerCount(dataset.get()); ++i) {
      if (!made->add(GDALDatasetGetLayer(dataset.get(), i), map.get(), isCancelled, error)) return nullptr;
    }
    if (made->points_.features.empty() && made->lines_.features.empty() && made->rings_.features.empty()) {
      *error = made->lost_ > 0 ? "none of it can be brought into the projection of the map"
                               : "it has no points and no lines";
      return nullptr;
    }
    made->finish();
    return made;
  }

  bool isRaster() const override { return false; }
  const std::string& notice() const override { return notice_; }
  const RasterNames& rasters() const override { return none_; }
  bool paint(const BackgroundFrame&, std::span<std::uint32_t>, const std::function<bool()>&,
             std::string* error) override {
    *error = "it is no raster";
    return false;
  }
  const std::vector<VectorLayer>& shapes() const override { return shapes_; }

 private:
  static constexpr std::size_t kMostPoints = 5'000'000;

  bool add(OGRLayerH layer, OGRSpatialReferenceH map, const std::function<bool()>& isCancelled,
           std::string* error) {
    const OGRSpatialReferenceH own = OGR_L_GetSpatialRef(layer);
    Way way;
    if (map == nullptr) {
      if (own != nullptr) notice_ = kLocalMap;
    } else if (own == nullptr) {
      notice_ = kNoProjection;
    } else {
      OSRSetAxisMappingStrategy(own, OAMS_TRADITIONAL_GIS_ORDER);
      way.reset(OCTNewCoordinateTransformation(own, map));
      if (!way) {
        *error = lastError("it can't be brought into the projection of the map");
        return false;
      }
    }
    OGR_L_ResetReading(layer);
    while (const Feature feature{OGR_L_GetNextFeature(layer)}) {
      if (isCancelled()) return false;
      const OGRGeometryH geometry = OGR_F_GetGeometryRef(feature.get());
      if (geometry == nullptr) continue;
      if (way && OGR_G_Transform(geometry, way.get()) != OGRERR_NONE) {
        ++lost_;
        continue;
      }
      take(geometry);
    }
    return true;
  }

  void take(OGRGeometryH geometry) {
    const OGRwkbGeometryType type = wkbFlatten(OGR_G_GetGeometryType(geometry));
    if (OGR_GT_IsNonLinear(type) != 0 && type != wkbGeometryCollection) {
      OGRGeometryH straight = OGR_G_GetLinearGeometry(geometry, 0, nullptr);
      if (straight != nullptr && wkbFlatten(OGR_G_GetGeometryType(straight)) != type) take(straight);
      OGR_G_DestroyGeometry(straight);
      return;
    }
    const bool isPolygon = type == wkbPolygon || type == wkbTriangle;
    for (int i = 0; i < OGR_G_GetGeometryCount(geometry); ++i) {
      const OGRGeometryH part = OGR_G_GetGeometryRef(geometry, i);
      isPolygon ? takePoints(part, rings_) : take(part);
    }
    if (type == wkbPoint) takePoints(geometry, points_);
    if (type == wkbLineString) takePoints(geometry, lines_);
  }

  void takePoints(OGRGeometryH geometry, VectorLayer& layer) {
    const int count = OGR_G_GetPointCount(geometry);
    if (count < 1) return;
    if (count_ + static_cast<std::size_t>(count) > kMostPoints) {
      isCut_ = true;
      return;
    }
    VectorFeature feature;
    for (int i = 0; i < count; ++i) {
      const std::array<double, 2> at{OGR_G_GetX(geometry, i), OGR_G_GetY(geometry, i)};
      if (std::isfinite(at[0]) && std::isfinite(at[1])) feature.points.push_back(at);
    }
    count_ += feature.points.size();
    if (!feature.points.empty()) layer.features.push_back(std::move(feature));
  }

  void finish() {
    const auto say = [this](const std::string& text) { notice_ += (notice_.empty() ? "" : "; ") + text; };
    if (lost_ > 0) say(std::to_string(lost_) + " of its features can't be brought onto the map");
    if (isCut_) say("it has more than " + std::to_string(kMostPoints) + " points, the rest is left out");
    points_.shape = VectorShape::points;
    rings_.shape = VectorShape::polygon;
    for (VectorLayer* layer : {&rings_, &lines_, &points_}) shapes_.push_back(std::move(*layer));
  }

  RasterNames none_;
  VectorLayer points_;
  VectorLayer lines_;
  VectorLayer rings_;
  std::vector<VectorLayer> shapes_;
  std::size_t count_ = 0;
  std::size_t lost_ = 0;
  bool isCut_ = false;
  std::string notice_;
};

}  // namespace
}  // namespace gridbay

extern "C" gridbay::Background* gridbayOpenBackground(const char* path, const char* raster,
                                                      const char* projection,
                                                      const std::function<bool()>* isCancelled,
                                                      std::string* error) {
  GDALAllRegister();
  const gridbay::QuietErrors quiet;
  gridbay::OpenedFile file = gridbay::openAnyFile(path, raster, error);
  if (!file.dataset) return nullptr;
  if (GDALGetRasterCount(file.dataset.get()) > 0)
    return gridbay::RasterBackground::open(std::move(file), projection, error).release();
  return gridbay::VectorBackground::open(file.dataset, projection, *isCancelled, error).release();
}
