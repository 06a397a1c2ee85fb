#pragma once

#include <map>
#include <memory>
#include <optional>
#include <span>
#include <string>

#include "map/map_scene.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/transformation.h"

namespace gridbay {

// The coordinates of a map, and the ways to them from other projections, each made once.
class MapCoordinates {
 public:
  MapCoordinates() : projection_("") {}

  // Of Area 1, by its text; empty for local coordinates. True where it is another one than before.
  bool setProjection(const std::string& text);
  const std::string& text() const { return text_; }
  const CVdMapProjection& projection() const { return projection_; }
  bool isLocal() const { return projection_.IsLocal(); }

  // Where a grid's first point lies by its file; nothing where that has no place on this map.
  std::optional<MapPoint> placeOf(const std::string& projection, double longitude, double latitude);
  // Brings points of another projection onto the map, and back; why that can't be done, or empty. Points that
  // the other one can't hold become infinite.
  std::string toMap(const std::string& projection, std::span<MapPoint> points);
  std::string fromMap(const std::string& projection, std::span<MapPoint> points);

 private:
  struct Way {
    Transformation there;
    Transformation back;
  };
  // Nothing where no change is needed; else the way, which may be none.
  const Way* wayOf(const std::string& projection, std::string* fault);

  std::string text_;
  CVdMapProjection projection_;
  std::map<std::string, std::unique_ptr<Way>, std::less<>> ways_;
};

}  // namespace gridbay
