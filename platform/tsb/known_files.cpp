#include "platform/tsb/known_files.h"

#include <sys/stat.h>

#include <algorithm>
#include <ctime>
#include <optional>

namespace gridbay {
namespace {

constexpr std::size_t kMostFiles = 64;

}  // namespace

bool KnownFiles::holds(const std::string& path, const std::function<bool()>& check) {
  const auto stateOf = [&path]() -> std::optional<State> {
    struct stat file {};
    if (::stat(path.c_str(), &file) != 0) return std::nullopt;
    return State{static_cast<std::int64_t>(file.st_dev), static_cast<std::int64_t>(file.st_ino), file.st_size,
                 file.st_ctim.tv_sec, file.st_ctim.tv_nsec};
  };
  const std::optional<State> before = stateOf();
  if (before && std::ranges::find(known_, *before) != known_.end()) return true;
  if (!check()) return false;
  constexpr std::time_t kMoment = 2;
  if (!before || stateOf() != before || std::time(nullptr) - (*before)[3] < kMoment) return true;
  known_.insert(known_.begin(), *before);
  known_.resize(std::min(known_.size(), kMostFiles));
  return true;
}

}  // namespace gridbay
