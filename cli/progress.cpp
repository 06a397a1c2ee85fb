#include "cli/progress.h"

#include <unistd.h>

#include <algorithm>
#include <iostream>

namespace gridbay::cli {
namespace {

constexpr auto kShort = std::chrono::milliseconds(300);
constexpr auto kBetweenLines = std::chrono::seconds(10);

}  // namespace

Progress::Progress(const Console& console, std::string what, std::size_t total, bool onTerminal, Clock now)
    : console_(console),
      what_(std::move(what)),
      total_(std::max<std::size_t>(total, 1)),
      onTerminal_(onTerminal),
      now_(std::move(now)),
      next_(now_() + (onTerminal ? kShort : std::chrono::milliseconds(kBetweenLines))) {}

Progress::~Progress() {
  if (shown_ && onTerminal_) console_.err << '\n' << std::flush;
}

void Progress::reached(std::size_t done) {
  const std::size_t percent = done * 100 / total_;
  if (percent == shownPercent_ || now_() < next_) return;
  shownPercent_ = percent;
  shown_ = true;
  if (onTerminal_) {
    console_.err << '\r' << what_ << ' ' << percent << " %" << std::flush;
  } else {
    console_.err << what_ << ' ' << percent << " %\n" << std::flush;
    next_ = now_() + kBetweenLines;
  }
}

bool Progress::isTerminal(const Console& console) {
  return &console.err == &std::cerr && ::isatty(STDERR_FILENO) == 1;
}

}  // namespace gridbay::cli
