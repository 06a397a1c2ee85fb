#include "conversion/background.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>

#include "conversion/raster_reader.h"
#include "conversion/tsb_raster.h"
#include "platform/cartography/cartography.h"

namespace gridbay {
namespace {

Failure cannotShow(const std::string& path, const std::string& why) {
  return Failure{fmt::format("cannot show \"{}\": {}", path, why)};
}

// Of a map of our own the raster of a name, or the first one.
Result<std::unique_ptr<Raster>> ownRaster(const std::string& path, RasterNames& names,
                                          const std::string& raster) {
  const Result<std::unique_ptr<Raster>> file = openTsbRaster(path, 0);
  if (!file) return Failure{file.error()};
  const std::vector<std::string> all = (*file)->subdatasets();
  const auto found = std::ranges::find(all, raster);
  const std::size_t place = found == all.end() ? 0 : static_cast<std::size_t>(found - all.begin());
  if (all.size() > 1) names = {all, all[place]};
  return openTsbRaster(path, static_cast<int>(place) + 1);
}

}  // namespace

bool needsBackgroundCopy(const std::string& path) {
  if (std::filesystem::path(path).extension().string().starts_with(".tsb")) return true;
  const Result<void*> entry = rasterModuleEntry(kNeedsCopy);
  return entry && reinterpret_cast<NeedsCopy>(*entry)(path.c_str());
}

Result<std::unique_ptr<Background>> openBackground(const std::string& path, const std::string& raster,
                                                   const std::string& projection,
                                                   const std::function<bool()>& isCancelled) {
  const Result<void*> entry = rasterModuleEntry(kOpenBackground);
  if (!entry) return Failure{entry.error()};
  std::string why;
  Background* made = reinterpret_cast<OpenBackground>(*entry)(path.c_str(), raster.c_str(),
                                                              projection.c_str(), &isCancelled, &why);
  if (made == nullptr) return cannotShow(path, why);
  return std::unique_ptr<Background>(made);
}

Result<BackgroundCopy> copyBackground(const std::string& path, const std::string& raster,
                                      const std::string& projection, const BackgroundFrame& frame,
                                      const std::string& made, const std::function<bool(double)>& progress) {
  const Result<void*> entry = rasterModuleEntry(kCopyBackground);
  if (!entry) return Failure{entry.error()};
  BackgroundCopy copy;
  std::unique_ptr<Raster> own;
  if (isTsbRaster(path)) {
    Result<std::unique_ptr<Raster>> opened = ownRaster(path, copy.rasters, raster);
    if (!opened) return Failure{opened.error()};
    own = std::move(*opened);
  }
  const std::string name = own ? own->projection() : std::string();
  const std::string ownProjection = name.empty() ? std::string() : CVdMapProjection(name).Wkt2();
  const CopyWanted wanted{path, raster, own.get(), ownProjection, projection, frame, made, progress};
  std::string why;
  if (!reinterpret_cast<CopyBackground>(*entry)(&wanted, &copy, &why)) return cannotShow(path, why);
  return copy;
}

}  // namespace gridbay
