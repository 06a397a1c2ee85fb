#include "platform/files/file_stamp.h"

#include <sys/stat.h>

namespace gridbay {

std::optional<FileStamp> fileStamp(const std::string& path) {
  struct stat file {};
  if (path.empty() || ::stat(path.c_str(), &file) != 0) return std::nullopt;
  return FileStamp{static_cast<std::int64_t>(file.st_dev),
                   static_cast<std::int64_t>(file.st_ino),
                   file.st_size,
                   {file.st_mtim.tv_sec, file.st_mtim.tv_nsec},
                   {file.st_ctim.tv_sec, file.st_ctim.tv_nsec}};
}

}  // namespace gridbay
