#pragma once

#include <cstddef>
#include <functional>
#include <optional>
#include <string>

#include "platform/result.h"

namespace gridbay {

// How many processes this one may have computing at once.
std::size_t coreCount();

// Does pieces of work, numbered from 0, in copies of this process, as many of them side by side as it has
// cores. Each copy begins with all that this process has in memory, takes the next piece that none has taken,
// and hands back a text. The libraries below are no more than one thread's, and what one piece does to memory
// no other sees.
struct SideBySide {
  std::size_t count = 0;
  std::function<std::string(std::size_t piece)> work;
  // Is given what came of each piece, here, as it comes; nothing of one that ended its copy by a crash or an
  // exception. The pieces after it are done all the same.
  std::function<void(std::size_t piece, std::optional<std::string> text)> took;
  // Asked often; when it holds no further piece is begun, and those that are being done are finished.
  std::function<bool()> isStopped = [] { return false; };
  std::size_t processes = coreCount();

  // Fails where no copy can be made.
  Outcome run() const;
};

}  // namespace gridbay
