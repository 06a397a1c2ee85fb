#pragma once

#include <cpl_error.h>
#include <cpl_string.h>
#include <gdal.h>

#include <memory>
#include <optional>
#include <string>

#include "conversion/background.h"
#include "conversion/raster.h"

// What the sources of the raster module have in common. The module alone includes it.
namespace gridbay {

struct CloseDataset {
  void operator()(GDALDatasetH dataset) const { GDALClose(dataset); }
};
using Dataset = std::unique_ptr<void, CloseDataset>;
struct FreeTexts {
  void operator()(char** texts) const { CSLDestroy(texts); }
};

// The library's errors stay out of the program's output, in the thread that this lives in.
class QuietErrors {
 public:
  QuietErrors() {
    CPLPushErrorHandler(CPLQuietErrorHandler);
    CPLErrorReset();
  }
  QuietErrors(const QuietErrors&) = delete;
  QuietErrors& operator=(const QuietErrors&) = delete;
  ~QuietErrors() { CPLPopErrorHandler(); }
};
std::string lastError(const char* otherwise);

// By its own coordinates, by points of it, or by a model of its camera.
bool hasPlace(GDALDatasetH dataset);
// How many bands make up the picture of a raster, from the first on: three that are colours, or else one.
int shownBands(GDALDatasetH dataset);

// A file of rasters or of vectors. Of several rasters it is the one of a name, or else the first that has a
// place, or else the first. No data set with the reason.
struct OpenedFile {
  Dataset dataset;
  RasterNames rasters;
};
OpenedFile openAnyFile(const std::string& path, const std::string& raster, std::string* error);

// The chosen band of a raster in memory, with land as missing values from a value on; null with the reason.
Dataset inMemory(Raster& raster, const std::optional<float>& land, std::string* error);

}  // namespace gridbay
