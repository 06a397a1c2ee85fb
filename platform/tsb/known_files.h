#pragma once

#include <functional>
#include <optional>
#include <span>
#include <string>
#include <vector>

#include "platform/files/file_stamp.h"

namespace gridbay {

// The files for which a check has held and that have not been written to since, the latest ones first. One
// that was written to in the last moments is not kept, as the next write might bear the same time.
class KnownFiles {
 public:
  // Whether a check holds for each of some files.
  using Check = std::function<std::vector<bool>(std::span<const std::string> paths)>;

  // Whether the check holds for each file as it is now. It is asked once, for those that are not known.
  std::vector<bool> hold(std::span<const std::string> paths, const Check& check);

  // The stamp of a file which is known as it is now.
  std::optional<FileStamp> known(const std::string& path) const;

 private:
  void keep(const FileStamp& state);

  std::vector<FileStamp> known_;
};

}  // namespace gridbay
