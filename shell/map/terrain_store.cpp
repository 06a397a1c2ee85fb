#include "shell/map/terrain_store.h"

#include <algorithm>
#include <cmath>

#include "platform/tsb/tsb_file.h"

namespace gridbay::shell {

const TerrainStore::Opened& TerrainStore::openedOf(const MapArea& area) {
  Opened& opened = opened_[{area.file, area.item}];
  if ((opened.grid || !opened.fault.isEmpty()) && opened.state == area.fileState) return opened;
  opened = {area.fileState, nullptr, {}};
  if (Result<StoredGrid> grid = StoredGrid::open(area.file, static_cast<std::size_t>(area.item))) {
    opened.grid = std::make_shared<const StoredGrid>(std::move(*grid));
  } else {
    opened.fault = QString::fromStdString(grid.error());
  }
  return opened;
}

std::vector<TerrainArea> TerrainStore::open(const MapScene& scene) {
  std::vector<const MapArea*> areas;
  std::vector<std::string> unknown;
  for (const MapArea& area : scene.areas) {
    if (!area.isPlaced || area.file.empty()) continue;
    areas.push_back(&area);
    if (!opened_.contains({area.file, area.item})) unknown.push_back(area.file);
  }
  if (unknown.size() > 1) TsbFile::lookAhead(unknown);
  // What the setup has no more is let go.
  std::erase_if(opened_, [&areas](const auto& each) {
    return std::ranges::none_of(areas, [&](const MapArea* area) {
      return area->file == each.first.first && area->item == each.first.second;
    });
  });
  std::ranges::stable_sort(areas, {}, [](const MapArea* area) { return area->level; });
  faults_.clear();
  std::vector<TerrainArea> terrain;
  for (const MapArea* area : areas) {
    const Opened& opened = openedOf(*area);
    if (opened.grid) terrain.push_back({opened.grid, area->grid, area->landValue});
    if (!opened.fault.isEmpty()) faults_ << opened.fault;
  }
  return terrain;
}

std::optional<float> TerrainStore::valueAt(const MapArea& area, GridPoint point) const {
  const auto found = opened_.find({area.file, area.item});
  if (found == opened_.end() || !found->second.grid || point.j < 0 || point.k < 0) return std::nullopt;
  float value = 0;
  const StoredGrid& grid = *found->second.grid;
  if (!grid.read(static_cast<std::size_t>(point.k), static_cast<std::size_t>(point.j), {&value, 1}) ||
      value == grid.missing() || std::isnan(value))
    return std::nullopt;
  return value;
}

}  // namespace gridbay::shell
