#include "conversion/raster_reader.h"

#include <dlfcn.h>
#include <fmt/format.h>

#include "conversion/tsb_raster.h"
#include "platform/files/program_path.h"

namespace gridbay {
namespace {

// Of what the module has made: the raster, or why there is none.
Result<std::unique_ptr<Raster>> taken(Raster* made, const std::string& path, const std::string& why) {
  if (made == nullptr) return Failure{fmt::format("cannot read \"{}\": {}", path, why)};
  return std::unique_ptr<Raster>(made);
}

}  // namespace

Result<void*> rasterModuleEntry(const char* name) {
  const std::string module = pluginFolder() + "/v27raster.so";
  void* library = ::dlopen(module.c_str(), RTLD_NOW | RTLD_LOCAL);
  void* entry = library == nullptr ? nullptr : ::dlsym(library, name);
  if (entry == nullptr)
    return Failure{fmt::format("The raster reader \"{}\" cannot be loaded: {}", module, ::dlerror())};
  return entry;
}

Result<std::unique_ptr<Raster>> openAnyRaster(const std::string& path, int subdataset) {
  if (isTsbRaster(path)) return openTsbRaster(path, subdataset);
  const Result<void*> entry = rasterModuleEntry(kOpenRaster);
  if (!entry) return Failure{entry.error()};
  std::string why;
  return taken(reinterpret_cast<OpenRaster>(*entry)(path.c_str(), subdataset, &why), path, why);
}

Result<std::unique_ptr<Raster>> openWarpedRaster(const std::string& path, int subdataset,
                                                 const WarpTarget& target) {
  const Result<void*> entry = rasterModuleEntry(kOpenWarped);
  if (!entry) return Failure{entry.error()};
  std::string why;
  return taken(reinterpret_cast<OpenWarped>(*entry)(path.c_str(), subdataset, &target, &why), path, why);
}

Result<std::unique_ptr<Raster>> warpRaster(Raster& raster, const WarpTarget& target) {
  const Result<void*> entry = rasterModuleEntry(kWarpRaster);
  if (!entry) return Failure{entry.error()};
  std::string why;
  return taken(reinterpret_cast<WarpRaster>(*entry)(&raster, &target, &why), raster.files().front(), why);
}

Result<std::unique_ptr<Raster>> gridPoints(PointGrid points) {
  const Result<void*> entry = rasterModuleEntry(kGridPoints);
  if (!entry) return Failure{entry.error()};
  std::string why;
  Raster* grid = reinterpret_cast<GridPoints>(*entry)(&points, &why);
  if (grid == nullptr) return Failure{fmt::format("The points can't be gridded: {}", why)};
  return std::unique_ptr<Raster>(grid);
}

}  // namespace gridbay
