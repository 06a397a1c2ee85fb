#include "platform/tsb/netcdf_file.h"

#include <hdf5.h>
#include <netcdf.h>

namespace gridbay {

std::optional<NetcdfFile> NetcdfFile::open(const std::string& path) {
  int id = 0;
  // What is no error here would be printed otherwise: each thread has its own choice, and the library above
  // makes it for its first one alone.
  [[maybe_unused]] thread_local const herr_t quiet = H5Eset_auto2(H5E_DEFAULT, nullptr, nullptr);
  if (nc_open(path.c_str(), NC_NOWRITE, &id) != NC_NOERR) return std::nullopt;
  return NetcdfFile(id);
}

NetcdfFile::~NetcdfFile() {
  if (id_ >= 0) nc_close(id_);
}

}  // namespace gridbay
