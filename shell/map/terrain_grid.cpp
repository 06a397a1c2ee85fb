#include "shell/map/terrain_grid.h"

namespace gridbay::shell {

void TerrainGrid::open(const std::function<bool()>& isCancelled) {
  if (isTried_) return;
  Result<StoredGrid> grid = StoredGrid::open(source_, isCancelled);
  if (!grid && isCancelled && isCancelled()) return;
  const std::lock_guard lock(mutex_);
  if (isTried_) return;
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
