#pragma once

namespace gridbay::cli {

// While it lives, a signal to stop (SIGINT, SIGTERM, SIGHUP) is taken down instead of ending this program; a
// second one ends it. One at a time.
class StopSignals {
 public:
  StopSignals();
  StopSignals(const StopSignals&) = delete;
  StopSignals& operator=(const StopSignals&) = delete;
  ~StopSignals();

  bool isStopped() const;
};

}  // namespace gridbay::cli
