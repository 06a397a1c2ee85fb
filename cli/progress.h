#pragma once

#include <chrono>
#include <string>

#include "cli/console.h"

namespace gridbay::cli {

// Tells how far a long piece of work is, on standard error, and nothing at all of a short one.
class Progress {
 public:
  Progress(const Console& console, std::string what, std::size_t total);
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;
  ~Progress();

  void reached(std::size_t done);

 private:
  const Console& console_;
  std::string what_;
  std::size_t total_;
  std::chrono::steady_clock::time_point start_;
  std::size_t shownPercent_ = 0;
  bool shown_ = false;
};

}  // namespace gridbay::cli
