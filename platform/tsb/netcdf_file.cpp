#include "platform/tsb/netcdf_file.h"

#include <netcdf.h>

namespace gridbay {

std::optional<NetcdfFile> NetcdfFile::open(const std::string& path) {
  int id = 0;
  if (nc_open(path.c_str(), NC_NOWRITE, &id) != NC_NOERR) return std::nullopt;
  return NetcdfFile(id);
}

NetcdfFile::~NetcdfFile() {
  if (id_ >= 0) nc_close(id_);
}

}  // namespace gridbay
