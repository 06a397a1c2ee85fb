#pragma once

#include <map>
#include <string>
#include <vector>

#include "core/shared_array.h"
#include "map/map_coordinates.h"
#include "map/map_scene.h"
#include "setup/global_kvs.h"
#include "structures/dike.h"

// Dikes, weirs and culverts, which have coordinates of their own.

namespace gridbay {

// The polyline of a structure in its own projection.
struct StructureLine {
  std::string name;
  std::string projection;
  std::vector<MapPoint> points;
};

bool isStructure(MapKind kind);
PageId pageOfStructure(MapKind kind);
int structureCount(CGlobalKvs& root, MapKind kind);
void setStructureCount(CGlobalKvs& root, MapKind kind, int count);
// The number from 1 must be in range.
StructureLine structureLine(CGlobalKvs& root, MapKind kind, int number);
void giveProjection(CGlobalKvs& root, MapKind kind, int number, const std::string& projection);

// Points are in the structure's own projection; a new point of a dike has the crest level of the one before.
void moveStructurePoint(CGlobalKvs& root, MapKind kind, int number, std::size_t vertex, MapPoint place);
void insertStructurePoint(CGlobalKvs& root, MapKind kind, int number, std::size_t vertex, MapPoint place);
void removeStructurePoint(CGlobalKvs& root, MapKind kind, int number, std::size_t vertex);
void removeStructure(CGlobalKvs& root, MapKind kind, int number);

// The structures on the map. What has been brought there is kept until a structure, or the map, changes.
class StructureLines {
 public:
  void append(CGlobalKvs& root, MapCoordinates& coordinates, const std::vector<MapArea>& areas,
              std::vector<MapFeature>& features);
  // To be called when the map has another projection.
  void forget() { known_.clear(); }

 private:
  struct Known {
    std::string projection{};
    SharedArray<DikePoint> dike{};
    std::vector<double> x{};
    std::vector<double> y{};
    MapLine line{};
    std::string fault{};
    MapGrid outer{};  // against which the fault was found
    std::int32_t outerNx = -1;
    std::int32_t outerNy = -1;
  };
  void place(Known& known, const std::vector<MapPoint>& own, MapCoordinates& coordinates);
  void check(Known& known, const std::vector<MapArea>& areas);

  std::map<std::pair<MapKind, int>, Known> known_;
};

}  // namespace gridbay
