#include "shell/map/terrain_grid.h"

#include <chrono>

namespace gridbay::shell {

void TerrainGrid::open(const std::function<bool()>& isCancelled) {
  using namespace std::chrono_literals;
  std::unique_lock alone(opening_, std::defer_lock);
  while (!isTried_ && !alone.try_lock_for(20ms)) {
    if (isCancelled && isCancelled()) return;
  }
  if (isTried_) return;
  Result<StoredGrid> grid = StoredGrid::open(source_, [&](double done) {
    progress_ = done;
    return !isCancelled || !isCancelled();
  });
  if (!grid && isCancelled && isCancelled()) return;
  const std::lock_guard lock(mutex_);
  if (grid) {
    grid_ = std::make_unique<const StoredGrid>(std::move(*grid));
    opened_ = grid_.get();
  } else {
    fault_ = QString::fromStdString(grid.error());
  }
  isTried_ = true;
}

QString TerrainGrid::fault() const {
  const std::lock_guard lock(mutex_);
  return fault_;
}

}  // namespace gridbay::shell
