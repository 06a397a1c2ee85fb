#include <gdal_alg.h>
#include <gdal_utils.h>
#include <gdalwarper.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <cmath>
#include <fstream>
#include <string>
#include <string_view>

#include "conversion/gdal_files.h"

namespace gridbay {
namespace {

struct FreeTransformer {
  void operator()(void* way) const { GDALDestroyGenImgProjTransformer(way); }
};
struct FreeTranslation {
  void operator()(GDALTranslateOptions* options) const { GDALTranslateOptionsFree(options); }
};
struct FreeVectorTranslation {
  void operator()(GDALVectorTranslateOptions* options) const { GDALVectorTranslateOptionsFree(options); }
};

// Formats whose library serves one thread, or is the one of data files.
constexpr std::array<std::string_view, 5> kOfOneThread{"netCDF", "GMT", "HDF5", "HDF5Image", "BAG"};

bool isOfOneThread(const char* path) {
  const GDALDriverH driver = GDALIdentifyDriverEx(path, GDAL_OF_RASTER | GDAL_OF_VECTOR, nullptr, nullptr);
  return driver != nullptr &&
         std::ranges::find(kOfOneThread, std::string_view(GDALGetDriverShortName(driver))) !=
             kOfOneThread.end();
}

// A virtual raster may have such files in it.
bool namesSuchFiles(const char* path) {
  const GDALDriverH driver = GDALIdentifyDriverEx(path, GDAL_OF_RASTER | GDAL_OF_VECTOR, nullptr, nullptr);
  if (driver == nullptr || !std::string_view(GDALGetDriverShortName(driver)).ends_with("VRT")) return false;
  std::ifstream file(path);
  for (std::string line; std::getline(file, line);) {
    std::ranges::transform(line, line.begin(),
                           [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    for (const std::string_view word : {"netcdf:", "hdf5:", "bag:"}) {
      if (line.find(word) != std::string::npos) return true;
    }
    // As the text of an element, or as an attribute.
    for (const std::string_view ending : {".nc", ".nc4", ".cdf", ".h5", ".he5", ".hdf5", ".bag", ".grd"}) {
      for (const char behind : {'<', '"'}) {
        if (line.find(std::string(ending) + behind) != std::string::npos) return true;
      }
    }
  }
  return false;
}

int CPL_STDCALL goesOn(double done, const char*, void* progress) {
  return (*static_cast<const std::function<bool(double)>*>(progress))(done) ? TRUE : FALSE;
}

// In pixels of the raster.
struct Window {
  int left = 0;
  int top = 0;
  int columns = 0;
  int rows = 0;
};

// What a frame and its neighbourhood need of a raster: its first point, to stand for it, where they have
// nothing of it.
Window windowOf(GDALDatasetH raster, const std::string& projection, const BackgroundFrame& frame) {
  const Window whole{0, 0, GDALGetRasterXSize(raster), GDALGetRasterYSize(raster)};
  const bool isNamed = GDALGetSpatialRef(raster) != nullptr || GDALGetGCPSpatialRef(raster) != nullptr;
  const std::unique_ptr<char*, FreeTexts> settings(
      projection.empty() || !isNamed ? nullptr : CSLSetNameValue(nullptr, "DST_SRS", projection.c_str()));
  const std::unique_ptr<void, FreeTransformer> way(
      GDALCreateGenImgProjTransformer2(raster, nullptr, settings.get()));
  if (!way) return whole;
  constexpr int kSteps = 32;
  double left = whole.columns;
  double top = whole.rows;
  double right = 0;
  double bottom = 0;
  for (int i = 0; i <= kSteps; ++i) {
    for (int j = 0; j <= kSteps; ++j) {
      const auto along = [](int step) { return 3.0 * step / kSteps - 1; };
      double x = frame.west + along(i) * frame.width * frame.metresPerPixel;
      double y = frame.north - along(j) * frame.height * frame.metresPerPixel;
      double z = 0;
      int found = 0;
      if (GDALGenImgProjTransform(way.get(), TRUE, 1, &x, &y, &z, &found) == FALSE || found == 0) continue;
      left = std::min(left, x);
      right = std::max(right, x);
      top = std::min(top, y);
      bottom = std::max(bottom, y);
    }
  }
  const auto at = [](double place, int most) { return static_cast<int>(std::clamp<double>(place, 0, most)); };
  Window window{at(std::floor(left), whole.columns), at(std::floor(top), whole.rows)};
  window.columns = at(std::ceil(right), whole.columns) - window.left;
  window.rows = at(std::ceil(bottom), whole.rows) - window.top;
  return window.columns > 0 && window.rows > 0 ? window : Window{0, 0, 1, 1};
}

bool copyRaster(Dataset source, const CopyWanted& wanted, BackgroundCopy& copy, std::string* error) {
  constexpr double kMostPoints = 1 << 24;
  const int bands = shownBands(source.get());
  const auto points = [](const Window& window) { return static_cast<double>(window.columns) * window.rows; };
  Window window{0, 0, GDALGetRasterXSize(source.get()), GDALGetRasterYSize(source.get())};
  if (points(window) > kMostPoints) {
    const Window needed = windowOf(source.get(), wanted.projection, wanted.frame);
    copy.isWhole = points(needed) == points(window);
    window = needed;
  }
  const double step = std::ceil(std::sqrt(points(window) / kMostPoints));
  copy.isFull = step <= 1;
  copy.file = wanted.made + ".tif";
  std::vector<std::string> words{"-q", "-of", "GTiff", "-r", "near", "-co", "BIGTIFF=IF_SAFER"};
  for (int band = 1; band <= bands; ++band) words.insert(words.end(), {"-b", std::to_string(band)});
  words.push_back("-srcwin");
  for (const int each : {window.left, window.top, window.columns, window.rows})
    words.push_back(std::to_string(each));
  words.push_back("-outsize");
  for (const int each : {window.columns, window.rows})
    words.push_back(std::to_string(std::max(1, static_cast<int>(each / step))));
  char** list = nullptr;
  for (const std::string& word : words) list = CSLAddString(list, word.c_str());
  const std::unique_ptr<char*, FreeTexts> arguments(list);
  const std::unique_ptr<GDALTranslateOptions, FreeTranslation> options(
      GDALTranslateOptionsNew(arguments.get(), nullptr));
  GDALTranslateOptionsSetProgress(options.get(), goesOn,
                                  const_cast<std::function<bool(double)>*>(&wanted.progress));
  const Dataset made(GDALTranslate(copy.file.c_str(), source.get(), options.get(), nullptr));
  if (made) GDALFlushCache(made.get());  // a full disk may show here first
  if (made && CPLGetLastErrorType() != CE_Failure) return true;
  *error = lastError("it can't be read");
  return false;
}

bool copyShapes(Dataset source, const CopyWanted& wanted, BackgroundCopy& copy, std::string* error) {
  copy.file = wanted.made + ".gpkg";
  char format[] = "-f";
  char name[] = "GPKG";
  std::array<char*, 3> words{format, name, nullptr};
  const std::unique_ptr<GDALVectorTranslateOptions, FreeVectorTranslation> options(
      GDALVectorTranslateOptionsNew(words.data(), nullptr));
  GDALVectorTranslateOptionsSetProgress(options.get(), goesOn,
                                        const_cast<std::function<bool(double)>*>(&wanted.progress));
  GDALDatasetH from = source.get();
  const Dataset made(GDALVectorTranslate(copy.file.c_str(), nullptr, 1, &from, options.get(), nullptr));
  if (!made) *error = lastError("it can't be read");
  return made != nullptr;
}

}  // namespace
}  // namespace gridbay

extern "C" bool gridbayNeedsCopy(const char* path) {
  GDALAllRegister();
  const gridbay::QuietErrors quiet;
  return gridbay::isOfOneThread(path) || gridbay::namesSuchFiles(path);
}

extern "C" bool gridbayCopyBackground(const gridbay::CopyWanted* wanted, gridbay::BackgroundCopy* copy,
                                      std::string* error) {
  GDALAllRegister();
  const gridbay::QuietErrors quiet;
  gridbay::OpenedFile file;
  if (wanted->own != nullptr) {
    file.dataset = gridbay::inMemory(*wanted->own, wanted->own->landValue(), error);
    if (file.dataset) GDALSetProjection(file.dataset.get(), wanted->ownProjection.c_str());
  } else {
    file = gridbay::openAnyFile(wanted->path, wanted->raster, error);
    copy->rasters = file.rasters;
  }
  if (!file.dataset) return false;
  CPLErrorReset();
  if (GDALGetRasterCount(file.dataset.get()) < 1)
    return gridbay::copyShapes(std::move(file.dataset), *wanted, *copy, error);
  if (!gridbay::hasPlace(file.dataset.get())) {
    *error = "it does not say where it lies";
    return false;
  }
  double transform[6] = {};
  char** const places = GDALGetMetadata(file.dataset.get(), "GEOLOCATION");
  if (places == nullptr || GDALGetGeoTransform(file.dataset.get(), transform) == CE_None)
    return gridbay::copyRaster(std::move(file.dataset), *wanted, *copy, error);
  // What has a place for each of its points is brought to even steps.
  const char* projection = CSLFetchNameValue(places, "SRS");
  constexpr double kPart = 0.125;  // of a pixel
  gridbay::Dataset even(
      GDALAutoCreateWarpedVRT(file.dataset.get(), nullptr, projection, GRA_NearestNeighbour, kPart, nullptr));
  if (!even) {
    *error = gridbay::lastError("its points can't be placed");
    return false;
  }
  return gridbay::copyRaster(std::move(even), *wanted, *copy, error);
}
