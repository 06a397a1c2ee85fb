#include "conversion/gdal_files.h"

#include <algorithm>
#include <cmath>
#include <string_view>
#include <vector>

namespace gridbay {
namespace {

Dataset openAny(const std::string& name) {
  return Dataset(GDALOpenEx(name.c_str(),
                            GDAL_OF_RASTER | GDAL_OF_VECTOR | GDAL_OF_READONLY | GDAL_OF_VERBOSE_ERROR,
                            nullptr, nullptr, nullptr));
}

// A raster in a file: what opens it, and what it is called.
struct Part {
  std::string opens;
  std::string name;
};

// What stands behind the path in the library's own name, or else its description.
std::string shortName(const std::string& opens, const std::string& path, const char* description) {
  const std::size_t at = opens.find(path);
  std::string rest = at == std::string::npos ? "" : opens.substr(at + path.size());
  rest.erase(0, std::min(rest.find_first_not_of("\":/"), rest.size()));
  if (!rest.empty()) return rest;
  return description == nullptr ? opens : description;
}

std::vector<Part> partsOf(GDALDatasetH dataset, const std::string& path) {
  std::vector<Part> parts;
  // The list as a whole: some formats make it only when it is asked for.
  char** const list = GDALGetMetadata(dataset, "SUBDATASETS");
  for (int n = 1;; ++n) {
    const std::string key = "SUBDATASET_" + std::to_string(n);
    const char* opens = CSLFetchNameValue(list, (key + "_NAME").c_str());
    if (opens == nullptr) return parts;
    parts.push_back({opens, shortName(opens, path, CSLFetchNameValue(list, (key + "_DESC").c_str()))});
  }
}

}  // namespace

std::string lastError(const char* otherwise) {
  const std::string text = CPLGetLastErrorMsg();
  return text.empty() ? otherwise : text;
}

bool hasPlace(GDALDatasetH dataset) {
  double transform[6] = {};
  return GDALGetGeoTransform(dataset, transform) == CE_None || GDALGetGCPCount(dataset) > 0 ||
         GDALGetMetadata(dataset, "RPC") != nullptr || GDALGetMetadata(dataset, "GEOLOCATION") != nullptr;
}

int shownBands(GDALDatasetH dataset) {
  constexpr int kColours = 3;
  if (GDALGetRasterCount(dataset) < kColours) return 1;
  const GDALRasterBandH first = GDALGetRasterBand(dataset, 1);
  const bool isColour = GDALGetRasterColorInterpretation(first) == GCI_RedBand ||
                        GDALDataTypeIsFloating(GDALGetRasterDataType(first)) == FALSE;
  return isColour ? kColours : 1;
}

OpenedFile openAnyFile(const std::string& path, const std::string& raster, std::string* error) {
  constexpr const char* kUnknown = "it is of no kind that can be read";
  OpenedFile file{openAny(path), {}};
  if (!file.dataset) {
    *error = lastError(kUnknown);
    return file;
  }
  if (GDALGetRasterCount(file.dataset.get()) > 0 || GDALDatasetGetLayerCount(file.dataset.get()) > 0)
    return file;
  const std::vector<Part> parts = partsOf(file.dataset.get(), path);
  file.dataset.reset();
  std::string why = "it holds no raster and no features";
  for (const Part& part : parts) file.rasters.all.push_back(part.name);
  const auto named = std::ranges::find(parts, raster, &Part::name);
  const bool isNamed = !raster.empty() && named != parts.end();
  for (const Part& part : parts) {
    if (isNamed && part.name != raster) continue;
    Dataset opened = openAny(part.opens);
    if (!opened) why = lastError(kUnknown);
    if (!opened || GDALGetRasterCount(opened.get()) < 1) continue;
    const bool isPlaced = hasPlace(opened.get());
    if (!file.dataset || isPlaced) {
      file.dataset = std::move(opened);
      file.rasters.shown = part.name;
    }
    if (isPlaced) break;
  }
  if (!file.dataset) *error = why;
  return file;
}

Dataset inMemory(Raster& raster, const std::optional<float>& land, std::string* error) {
  constexpr float kMissing = -1e35F;
  GDALAllRegister();
  CPLSetErrorHandler(CPLQuietErrorHandler);
  const int columns = raster.columns();
  Dataset memory(GDALCreate(GDALGetDriverByName("MEM"), "", columns, raster.rows(), 1, GDT_Float32, nullptr));
  if (!memory) {
    *error = CPLGetLastErrorMsg();
    return nullptr;
  }
  const RasterPlace at = raster.place();
  double transform[6] = {
      at.first[0] - at.nextColumn[0] / 2 - at.nextRow[0] / 2, at.nextColumn[0], at.nextRow[0],
      at.first[1] - at.nextColumn[1] / 2 - at.nextRow[1] / 2, at.nextColumn[1], at.nextRow[1]};
  GDALSetGeoTransform(memory.get(), transform);
  GDALSetProjection(memory.get(), raster.projection().c_str());
  const GDALRasterBandH band = GDALGetRasterBand(memory.get(), 1);
  GDALSetRasterNoDataValue(band, kMissing);
  const std::optional<double> missing = raster.missingValue();
  std::vector<float> row(static_cast<std::size_t>(columns));
  for (int number = 0; number < raster.rows(); ++number) {
    if (!raster.read(number, row, error)) return nullptr;
    for (float& value : row) {
      const bool isMissing = !std::isfinite(value) || (missing && value == static_cast<float>(*missing));
      if (isMissing || (land && value >= *land)) value = kMissing;
    }
    if (GDALRasterIO(band, GF_Write, 0, number, columns, 1, row.data(), columns, 1, GDT_Float32, 0, 0) !=
        CE_None) {
      *error = CPLGetLastErrorMsg();
      return nullptr;
    }
  }
  return memory;
}

}  // namespace gridbay
