#include "platform/tsb/known_files.h"

#include <algorithm>
#include <ctime>

namespace gridbay {
namespace {

constexpr std::size_t kMostFiles = 64;

}  // namespace

std::optional<FileStamp> KnownFiles::known(const std::string& path) const {
  const std::optional<FileStamp> state = fileStamp(path);
  return state && std::ranges::find(known_, *state) != known_.end() ? state : std::nullopt;
}

void KnownFiles::keep(const FileStamp& state) {
  constexpr std::time_t kMoment = 2;
  if (std::time(nullptr) - state.changed.seconds < kMoment) return;
  std::erase(known_, state);
  known_.insert(known_.begin(), state);
  known_.resize(std::min(known_.size(), kMostFiles));
}

std::vector<bool> KnownFiles::hold(std::span<const std::string> paths, const Check& check) {
  std::vector<bool> holds(paths.size(), true);
  std::vector<std::string> unknown;
  std::vector<std::size_t> places;
  std::vector<std::optional<FileStamp>> before;
  for (std::size_t i = 0; i < paths.size(); ++i) {
    const std::optional<FileStamp> state = fileStamp(paths[i]);
    if (state && std::ranges::find(known_, *state) != known_.end()) continue;
    unknown.push_back(paths[i]);
    places.push_back(i);
    before.push_back(state);
  }
  if (unknown.empty()) return holds;
  const std::vector<bool> checked = check(unknown);
  for (std::size_t i = 0; i < unknown.size(); ++i) {
    holds[places[i]] = checked[i];
    if (checked[i] && before[i] && fileStamp(unknown[i]) == before[i]) keep(*before[i]);
  }
  return holds;
}

}  // namespace gridbay
