#include "cli/progress.h"

#include <algorithm>

namespace gridbay::cli {
namespace {

constexpr auto kShort = std::chrono::milliseconds(300);

}  // namespace

Progress::Progress(const Console& console, std::string what, std::size_t total)
    : console_(console),
      what_(std::move(what)),
      total_(std::max<std::size_t>(total, 1)),
      start_(std::chrono::steady_clock::now()) {}

Progress::~Progress() {
  if (shown_) console_.err << '\n' << std::flush;
}

void Progress::reached(std::size_t done) {
  const std::size_t percent = done * 100 / total_;
  if (percent == shownPercent_ || std::chrono::steady_clock::now() - start_ < kShort) return;
  shownPercent_ = percent;
  shown_ = true;
  console_.err << '\r' << what_ << ' ' << percent << " %" << std::flush;
}

}  // namespace gridbay::cli
