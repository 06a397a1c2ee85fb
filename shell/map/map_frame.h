#pragma once

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <algorithm>
#include <optional>

#include "map/map_scene.h"

namespace gridbay::shell {

// The part of the map that a picture shows: north is up, and a metre is as long upwards as it is across.
struct MapFrame {
  MapPoint centre;
  double metresPerPixel = 1;
  QSizeF size;  // pixels

  QPointF toScreen(MapPoint place) const {
    return {size.width() / 2 + (place.east - centre.east) / metresPerPixel,
            size.height() / 2 - (place.north - centre.north) / metresPerPixel};
  }
  MapPoint toMap(QPointF at) const {
    return {centre.east + (at.x() - size.width() / 2) * metresPerPixel,
            centre.north - (at.y() - size.height() / 2) * metresPerPixel};
  }
  // Where this frame's picture stands in another frame.
  QRectF in(const MapFrame& other) const {
    return {other.toScreen(toMap({0, 0})), other.toScreen(toMap({size.width(), size.height()}))};
  }
  void pan(QPointF pixels) {
    centre.east -= pixels.x() * metresPerPixel;
    centre.north += pixels.y() * metresPerPixel;
  }
  // What lies at `at` stays there.
  void zoom(double factor, QPointF at) {
    constexpr double kFinest = 1e-3;
    constexpr double kCoarsest = 1e6;
    const MapPoint held = toMap(at);
    metresPerPixel = std::clamp(metresPerPixel / factor, kFinest, kCoarsest);
    const MapPoint now = toMap(at);
    centre.east += held.east - now.east;
    centre.north += held.north - now.north;
  }
  bool operator==(const MapFrame&) const = default;
};

// What a scene's areas and features cover on the map, as east and north; nothing for an empty scene.
inline std::optional<QRectF> extentOf(const MapScene& scene) {
  std::optional<QRectF> extent;
  const auto add = [&extent](const MapPoint& place) {
    const QRectF point(place.east, place.north, 0, 0);
    if (!extent) {
      extent = point;
      return;
    }
    extent->setCoords(std::min(extent->left(), place.east), std::min(extent->top(), place.north),
                      std::max(extent->right(), place.east), std::max(extent->bottom(), place.north));
  };
  for (const MapArea& area : scene.areas) {
    if (!area.isPlaced) continue;
    for (const MapPoint& corner : area.corners) add(corner);
  }
  if (extent) return extent;
  for (const MapFeature& feature : scene.features) {
    for (const MapPoint& point : *feature.points) add(point);
  }
  return extent;
}

}  // namespace gridbay::shell
