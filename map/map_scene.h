#pragma once

#include <array>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "core/grid_point.h"

// All that a setup places, as a map draws it. Map coordinates are metres east and north in the projection of
// Area 1; where that has none, metres along its x and y.

namespace gridbay {

struct MapPoint {
  double east = 0;
  double north = 0;

  bool operator==(const MapPoint&) const = default;
};
using MapLine = std::shared_ptr<const std::vector<MapPoint>>;  // never null

// Where the points of a grid lie on the map: an affine map from J and K, which need not be whole.
struct MapGrid {
  MapPoint first;  // point (0,0)
  MapPoint stepJ;  // from a point to the next one along J
  MapPoint stepK;

  MapPoint at(double j, double k) const {
    return {first.east + j * stepJ.east + k * stepK.east, first.north + j * stepJ.north + k * stepK.north};
  }
  // J and K of a place on the map.
  std::array<double, 2> pointOf(MapPoint place) const {
    const double e = place.east - first.east;
    const double n = place.north - first.north;
    const double determinant = stepJ.east * stepK.north - stepK.east * stepJ.north;
    return {(e * stepK.north - n * stepK.east) / determinant,
            (n * stepJ.east - e * stepJ.north) / determinant};
  }
  bool operator==(const MapGrid&) const = default;
};

// An area. One that can't be placed, as its file or its enclosing area is missing, has no grid to draw.
struct MapArea {
  std::int32_t number = 1;
  std::string file{};  // absolute; empty where none is named
  // Another value when the file has been written to.
  std::uint64_t fileState = 0;
  std::int32_t item = 1;       // of the file, with the elevations
  GridPoint origin{};          // in the enclosing area; of no meaning for Area 1
  std::int32_t enclosing = 0;  // 0 for Area 1
  int level = 0;               // 0 for Area 1, 1 for what lies in it, and so on
  std::int32_t nx = 0;         // points along J
  std::int32_t ny = 0;
  double dx = 0;  // metres
  double dy = 0;
  double rotation = 0;  // of K, degrees clockwise from north
  float landValue = 0;  // a point at or above it is land
  bool isPlaced = false;
  MapGrid grid{};
  // The outline, half a cell beyond the outermost points: (0,0), last J, both last, last K.
  std::array<MapPoint, 4> corners{};
  // How far the file's own coordinates are from where the setup places the area (metres); nothing where the
  // file has none.
  std::optional<double> offBy{};
  std::string fault{};  // why it can't be so; empty where nothing is wrong
};

enum class MapKind : std::int32_t {
  boundary,    // open boundary: its two ends
  source,      // isolated source or sink, or both of a pair: source, then sink
  massBudget,  // polygon
  dike,        // polylines
  weir,
  culvert,
  outputMap,   // of the flow calculation: corners of a rectangle
  outputLine,  // two ends
  outputPoints,
  discharge,  // line through which a transport is taken: two ends
  box         // in which a mass is summed: corners of a rectangle
};

// What colours a feature.
enum class MapDrive : std::int32_t {
  none,
  levelConstant,
  levelSeries,  // sine series
  levelFile,
  fluxConstant,
  fluxSeries,
  fluxFile,
  ratingCurve,
  source,
  sink,
  pair,
  off  // left out of the calculation
};

struct MapFeatureId {
  MapKind kind = MapKind::boundary;
  std::int32_t number = 1;  // in its list
  std::int32_t page = 0;    // that the list belongs to; tells lists of one kind apart

  bool operator==(const MapFeatureId&) const = default;
};

struct MapFeature {
  MapFeatureId id{};
  std::string label{};
  MapDrive drive = MapDrive::none;
  std::int32_t area = 0;      // whose points it stands on; 0 where it has coordinates of its own
  std::int32_t lastArea = 0;  // of its last point: of a pair, that of the sink
  // Places on the map; without those that have none there.
  MapLine points{};
  bool isComplete = true;  // none is left out, so that its points can be told by their numbers
  bool closed = false;     // the last point is joined to the first
  bool joined = true;      // a line leads from each point to the next; else they stand alone
  // The cell that leads to it on its page, from 1, in the first grid with that many rows and columns; rows of
  // headers do not count. 0 for any.
  std::int32_t row = 0;
  std::int32_t column = 0;
  std::string fault{};
};

struct MapScene {
  std::string projection;      // its short name, "Local Coordinates" where there is none
  std::string projectionText;  // the full text; empty for local coordinates
  std::vector<MapArea> areas;  // in the order of their numbers
  std::vector<MapFeature> features;
  // The pages of what the module that is chosen writes, and more of which can be drawn; 0 where it has none.
  std::int32_t moduleOutputs = 0;
  std::int32_t moduleLines = 0;
  std::int32_t moduleBoxes = 0;

  // Null where there is none.
  const MapArea* area(std::int32_t number) const {
    const bool there = number >= 1 && static_cast<std::size_t>(number) <= areas.size();
    return there ? &areas[static_cast<std::size_t>(number) - 1] : nullptr;
  }
};

// A point of the grid of an area.
struct MapPick {
  std::int32_t area = 1;
  GridPoint point;
};

}  // namespace gridbay
