#pragma once

#include <QImage>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

#include "shell/map/map_frame.h"
#include "shell/map/terrain_grid.h"

namespace gridbay::shell {

// The values that the ends of the colour scale stand for, and how steep a slope (metres in a metre) is shaded
// in full.
struct TerrainScale {
  float least = 0;
  float greatest = 1;
  float steepest = 1;

  bool operator==(const TerrainScale&) const = default;
};

enum class TerrainColours { viridis, sea, grey };

struct TerrainStyle {
  TerrainColours colours = TerrainColours::viridis;
  std::optional<TerrainScale> scale;  // else that of what is in the picture
  bool land = true;                   // land has a colour; else it is left out
  bool hillShade = true;
  bool zeroLine = true;

  bool operator==(const TerrainStyle&) const = default;
};

// A grid in its place on the map.
struct TerrainArea {
  std::shared_ptr<TerrainGrid> values;
  MapGrid grid;
  float landValue = 0;
};

struct TerrainRequest {
  std::vector<TerrainArea> areas;  // the later ones on top
  MapFrame frame;                  // its size is that of the picture
  TerrainStyle style;
  bool isBase = false;  // of the whole map, to stand in for what is not read yet
  int version = 0;      // goes to the picture
};

struct TerrainPicture {
  QImage image;  // clear where there is no value
  MapFrame frame;
  TerrainScale scale;
  bool isBase = false;
  bool isFinal = true;
  int version = 0;
};

// The colour (opaque) of a part, 0 to 1, of a colour scale.
QRgb terrainColour(TerrainColours colours, double part);
QRgb landColour();

// Paints the areas of a frame whose grids are open: for each square of `step` pixels the nearest point.
// Nothing when it was cancelled, which is asked for every few rows.
std::optional<TerrainPicture> paintTerrain(const TerrainRequest& request, int step,
                                           const std::function<bool()>& isCancelled);

}  // namespace gridbay::shell
