#pragma once

#include <chrono>
#include <functional>
#include <string>

#include "cli/console.h"

namespace gridbay::cli {

// Tells how far a long piece of work is, on standard error, and nothing at all of a short one: on a terminal
// in one line that is written over, elsewhere in a line every ten seconds.
class Progress {
 public:
  using Clock = std::function<std::chrono::steady_clock::time_point()>;

  Progress(const Console& console, std::string what, std::size_t total)
      : Progress(console, std::move(what), total, isTerminal(console), &std::chrono::steady_clock::now) {}
  Progress(const Console& console, std::string what, std::size_t total, bool onTerminal, Clock now);
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;
  ~Progress();

  void reached(std::size_t done);

 private:
  static bool isTerminal(const Console& console);

  const Console& console_;
  std::string what_;
  std::size_t total_;
  bool onTerminal_;
  Clock now_;
  std::chrono::steady_clock::time_point next_;  // nothing is told before
  std::size_t shownPercent_ = 0;
  bool shown_ = false;
};

}  // namespace gridbay::cli
