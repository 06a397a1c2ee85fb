#pragma once

#include <array>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace gridbay {

// The files for which a check has held and that have not been written to since, the latest ones first. One
// that was written to in the last moments is not kept, as the next write might bear the same time.
class KnownFiles {
 public:
  // Whether the check holds for a file as it is now.
  bool holds(const std::string& path, const std::function<bool()>& check);

 private:
  // Device, number, size and the time of the last change to its content or owner, in seconds and nanoseconds.
  using State = std::array<std::int64_t, 5>;
  std::vector<State> known_;
};

}  // namespace gridbay
