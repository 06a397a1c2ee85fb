#include "conversion/vector_writer.h"

#include <fmt/format.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <filesystem>

#include "conversion/raster_reader.h"
#include "platform/files/unfinished_file.h"

namespace gridbay {

Outcome writeGeoPackage(const std::string& path, const VectorFile& file) {
  const Result<void*> entry = rasterModuleEntry(kWriteVectors);
  if (!entry) return Failure{entry.error()};
  if (UnfinishedFile(path).path().empty())
    return Failure{fmt::format("cannot write \"{}\": {}", path, std::strerror(errno))};
  const std::filesystem::path target(path);
  // Its library wants the extension, and a file that is not there.
  const std::filesystem::path made =
      target.parent_path() / fmt::format(".{}.{}.gpkg", target.stem().string(), ::getpid());
  std::error_code error;
  std::filesystem::remove(made, error);
  std::string why;
  if (!reinterpret_cast<WriteVectors>(*entry)(made.c_str(), &file, &why)) {
    std::filesystem::remove(made, error);
    return Failure{fmt::format("cannot write \"{}\": {}", path, why)};
  }
  std::filesystem::rename(made, target, error);
  if (!error) return {};
  const std::string reason = error.message();
  std::filesystem::remove(made, error);
  return Failure{fmt::format("cannot write \"{}\": {}", path, reason)};
}

}  // namespace gridbay
