#pragma once

#include <array>
#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace gridbay {

// The files for which a check has held and that have not been written to since, the latest ones first. One
// that was written to in the last moments is not kept, as the next write might bear the same time.
class KnownFiles {
 public:
  // Whether a check holds for each of some files.
  using Check = std::function<std::vector<bool>(std::span<const std::string> paths)>;

  // Whether the check holds for each file as it is now. It is asked once, for those that are not known.
  std::vector<bool> hold(std::span<const std::string> paths, const Check& check);

  // What tells a file from all others and from itself before a write: device, number, size and the time of
  // the last change to its content or owner, in seconds and nanoseconds.
  using State = std::array<std::int64_t, 5>;
  // That of a file which is known as it is now.
  std::optional<State> known(const std::string& path) const;
  // That of any file as it is now; nothing where there is none.
  static std::optional<State> stateOf(const std::string& path);

 private:
  void keep(const State& state);

  std::vector<State> known_;
};

}  // namespace gridbay
