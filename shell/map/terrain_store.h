#pragma once

#include <QStringList>
#include <map>
#include <memory>
#include <string>

#include "map/map_scene.h"
#include "shell/map/terrain_picture.h"

namespace gridbay::shell {

// The grids of a scene's areas, opened once and again only when a file has been written to.
class TerrainStore {
 public:
  // Those of the areas that are placed and can be read, the inner ones last.
  std::vector<TerrainArea> open(const MapScene& scene);
  // Why some could not be read, after the last `open`.
  const QStringList& faults() const { return faults_; }
  // The value of an area's point; nothing for missing values and what is not read.
  std::optional<float> valueAt(const MapArea& area, GridPoint point) const;

 private:
  struct Opened {
    std::uint64_t state = 0;
    std::shared_ptr<const StoredGrid> grid;
    QString fault;
  };
  const Opened& openedOf(const MapArea& area);

  std::map<std::pair<std::string, std::int32_t>, Opened> opened_;
  QStringList faults_;
};

}  // namespace gridbay::shell
