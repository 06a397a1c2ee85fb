#include "conversion/background.h"

#include <fmt/format.h>

#include "conversion/raster_reader.h"

namespace gridbay {

Result<std::unique_ptr<Background>> openBackground(const std::string& path, const std::string& projection,
                                                   const std::function<bool()>& isCancelled) {
  const Result<void*> entry = rasterModuleEntry(kOpenBackground);
  if (!entry) return Failure{entry.error()};
  std::string why;
  Background* made =
      reinterpret_cast<OpenBackground>(*entry)(path.c_str(), projection.c_str(), &isCancelled, &why);
  if (made == nullptr) return Failure{fmt::format("cannot show \"{}\": {}", path, why)};
  return std::unique_ptr<Background>(made);
}

}  // namespace gridbay
