#pragma once

#include <QString>
#include <atomic>
#include <functional>
#include <memory>
#include <mutex>

#include "platform/tsb/stored_grid.h"

namespace gridbay::shell {

// A grid that is found, and opened later in the thread that paints it, as that may take a while.
class TerrainGrid {
 public:
  explicit TerrainGrid(StoredGrid::Source source) : source_(std::move(source)) {}

  std::size_t columns() const { return source_.columns; }
  std::size_t rows() const { return source_.rows; }
  // Does nothing for one that is open, or can't be opened. One that is cancelled may be opened later. Another
  // thread that opens it already is waited for.
  void open(const std::function<bool()>& isCancelled);
  // Null until it is open. In any thread.
  const StoredGrid* opened() const { return opened_.load(); }
  bool isTried() const { return isTried_.load(); }
  // How much of the opening is done, 0 to 1.
  double progress() const { return isTried() ? 1 : progress_.load(); }
  // Why it can't be opened; empty until that is known.
  QString fault() const;

 private:
  StoredGrid::Source source_;
  std::timed_mutex opening_;
  mutable std::mutex mutex_;
  std::unique_ptr<const StoredGrid> grid_;
  QString fault_;
  std::atomic<const StoredGrid*> opened_ = nullptr;
  std::atomic<bool> isTried_ = false;
  std::atomic<double> progress_ = 0;
};

}  // namespace gridbay::shell
