#include "map/map_coordinates.h"

#include <fmt/format.h>

#include <cmath>

namespace gridbay {
namespace {

static_assert(sizeof(MapPoint) == 2 * sizeof(double));

std::span<double> pairsOf(std::span<MapPoint> points) {
  return {points.empty() ? nullptr : &points.front().east, 2 * points.size()};
}

}  // namespace

bool MapCoordinates::setProjection(const std::string& text) {
  if (text == text_) return false;
  text_ = text;
  projection_ = CVdMapProjection(text);
  ways_.clear();
  return true;
}

const MapCoordinates::Way* MapCoordinates::wayOf(const std::string& projection, std::string* fault) {
  if (projection == text_) return nullptr;
  const bool otherIsLocal = CVdMapProjection::IsLocal(projection);
  if (isLocal() && otherIsLocal) return nullptr;
  if (isLocal()) {
    *fault = "has coordinates of a projection, but the grid of Area 1 has none";
    return nullptr;
  }
  if (otherIsLocal) {
    *fault = "has local coordinates, but the grid of Area 1 has a projection";
    return nullptr;
  }
  auto found = ways_.find(projection);
  if (found == ways_.end()) {
    found =
        ways_.emplace(projection, std::make_unique<Way>(Way{{projection, text_}, {text_, projection}})).first;
  }
  if (projection == "UTM")
    *fault = "has UTM coordinates without a zone: give it, as in UTM-32";
  else if (!found->second->there.isValid() || !found->second->back.isValid())
    *fault = CVdMapProjection(projection).IsValid() ? "can't be brought into the projection of Area 1"
                                                    : "has a projection that is not known";
  return found->second.get();
}

std::string MapCoordinates::toMap(const std::string& projection, std::span<MapPoint> points) {
  std::string fault;
  const Way* way = wayOf(projection, &fault);
  if (fault.empty() && way != nullptr) way->there.apply(pairsOf(points));
  return fault;
}

std::string MapCoordinates::fromMap(const std::string& projection, std::span<MapPoint> points) {
  std::string fault;
  const Way* way = wayOf(projection, &fault);
  if (fault.empty() && way != nullptr) way->back.apply(pairsOf(points));
  return fault;
}

std::optional<MapPoint> MapCoordinates::placeOf(const std::string& projection, double longitude,
                                                double latitude) {
  MapPoint place;
  const bool isOwn = projection == text_;
  const bool found =
      isOwn ? projection_.Geo2Proj(longitude, latitude, &place.east, &place.north)
            : CVdMapProjection(projection).Geo2Proj(longitude, latitude, &place.east, &place.north);
  if (!found || (!isOwn && !toMap(projection, {&place, 1}).empty())) return std::nullopt;
  return std::isfinite(place.east) && std::isfinite(place.north) ? std::optional(place) : std::nullopt;
}

}  // namespace gridbay
