#include "shell/map/terrain_store.h"

#include <algorithm>
#include <cmath>

#include "platform/tsb/tsb_file.h"

namespace gridbay::shell {

const TerrainStore::Found& TerrainStore::foundOf(const MapArea& area) {
  Found& found = found_[{area.file, area.item}];
  if ((found.grid || !found.fault.isEmpty()) && found.state == area.fileState) return found;
  found = {area.fileState, nullptr, {}};
  if (Result<StoredGrid::Source> source = StoredGrid::find(area.file, static_cast<std::size_t>(area.item))) {
    found.grid = std::make_shared<TerrainGrid>(std::move(*source));
    if (!StoredGrid::opensInAnyThread()) found.grid->open({});
  } else {
    found.fault = QString::fromStdString(source.error());
  }
  return found;
}

std::vector<TerrainArea> TerrainStore::find(const MapScene& scene) {
  std::vector<const MapArea*> areas;
  std::vector<std::string> unknown;
  for (const MapArea& area : scene.areas) {
    if (!area.isPlaced || area.file.empty()) continue;
    areas.push_back(&area);
    if (!found_.contains({area.file, area.item})) unknown.push_back(area.file);
  }
  // The editor, which has looked at them, is a program part of its own.
  if (unknown.size() > 1) TsbFile::lookAhead(unknown);
  // What the setup has no more is let go.
  std::erase_if(found_, [&areas](const auto& each) {
    return std::ranges::none_of(areas, [&](const MapArea* area) {
      return area->file == each.first.first && area->item == each.first.second;
    });
  });
  std::ranges::stable_sort(areas, {}, [](const MapArea* area) { return area->level; });
  std::vector<TerrainArea> terrain;
  for (const MapArea* area : areas) {
    if (const Found& found = foundOf(*area); found.grid)
      terrain.push_back({found.grid, area->grid, area->landValue});
  }
  return terrain;
}

QStringList TerrainStore::faults() const {
  QStringList faults;
  for (const auto& [file, found] : found_) {
    const QString fault = found.grid ? found.grid->fault() : found.fault;
    if (!fault.isEmpty()) faults << fault;
  }
  return faults;
}

std::optional<float> TerrainStore::valueAt(const MapArea& area, GridPoint point) const {
  const auto found = found_.find({area.file, area.item});
  const StoredGrid* grid =
      found == found_.end() || !found->second.grid ? nullptr : found->second.grid->opened();
  if (grid == nullptr || point.j < 0 || point.k < 0) return std::nullopt;
  float value = 0;
  if (!grid->readAtOnce(static_cast<std::size_t>(point.k), static_cast<std::size_t>(point.j), value) ||
      value == grid->missing() || std::isnan(value))
    return std::nullopt;
  return value;
}

}  // namespace gridbay::shell
