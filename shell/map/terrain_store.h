#pragma once

#include <QStringList>
#include <map>
#include <memory>
#include <string>

#include "map/map_scene.h"
#include "shell/map/terrain_picture.h"

namespace gridbay::shell {

// The grids of a scene's areas, found once and again only when a file has been written to. They are opened by
// who paints them.
class TerrainStore {
 public:
  // Those of the areas that are placed, the inner ones last.
  std::vector<TerrainArea> find(const MapScene& scene);
  // Why some can't be shown, as far as that is known by now.
  QStringList faults() const;
  // The value of an area's point; nothing for missing values and what is not read.
  std::optional<float> valueAt(const MapArea& area, GridPoint point) const;

 private:
  struct Found {
    std::uint64_t state = 0;
    std::shared_ptr<TerrainGrid> grid;
    QString fault;
  };
  const Found& foundOf(const MapArea& area);

  std::map<std::pair<std::string, std::int32_t>, Found> found_;
};

}  // namespace gridbay::shell
