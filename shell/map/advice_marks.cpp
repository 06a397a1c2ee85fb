#include "shell/map/advice_marks.h"

#include <algorithm>
#include <optional>

#include "shell/advice_strip.h"

namespace gridbay::shell {
namespace {

// On a line of two ends its middle, else the first point.
std::optional<MapPoint> placeOn(const std::vector<MapPoint>& points) {
  if (points.empty()) return std::nullopt;
  if (points.size() != 2) return points.front();
  return MapPoint{(points[0].east + points[1].east) / 2, (points[0].north + points[1].north) / 2};
}

std::vector<MapPoint> pointsOf(const AdviceSite& site, const MapScene& scene) {
  std::vector<MapPoint> points;
  const MapArea* area = scene.area(site.area);
  if (area == nullptr || !area->isPlaced) return points;
  for (const GridPoint& point : site.points) points.push_back(area->grid.at(point.j, point.k));
  return points;
}

// The feature, or the area, that stands in the row of the page.
std::optional<MapPoint> placeOfRow(const PagePlace& place, const MapScene& scene) {
  const int number = place.entries.empty() ? place.column : place.entries.front().number;
  if (number < 1) return std::nullopt;
  if (place.page == PageId::bathymetry) {
    const MapArea* area = scene.area(number);
    return area != nullptr && area->isPlaced ? std::optional(area->grid.first) : std::nullopt;
  }
  // What comes with the water of a boundary or source stands where that does.
  const bool isBoundary = place.thing.starts_with("boundary ");
  const bool isSource = place.thing.starts_with("source ") || place.thing.starts_with("sink ");
  const auto found = std::ranges::find_if(scene.features, [&](const MapFeature& feature) {
    if (feature.id.number != number) return false;
    if (isBoundary) return feature.id.kind == MapKind::boundary;
    if (isSource) return feature.id.kind == MapKind::source;
    return feature.id.page == static_cast<std::int32_t>(place.page);
  });
  return found == scene.features.end() ? std::nullopt : placeOn(*found->points);
}

}  // namespace

std::vector<AdviceMark> marksOf(const std::vector<Advice>& advice, const MapScene& scene) {
  std::vector<AdviceMark> marks;
  for (std::size_t i = 0; i < advice.size(); ++i) {
    std::optional<MapPoint> place = placeOn(pointsOf(advice[i].site, scene));
    if (!place) place = placeOfRow(advice[i].place, scene);
    if (!place) continue;
    auto mark = std::ranges::find(marks, *place, &AdviceMark::place);
    if (mark == marks.end()) mark = marks.insert(marks.end(), {*place, {}, {}});
    mark->advice.push_back(static_cast<int>(i));
    mark->tip += (mark->tip.isEmpty() ? "" : "\n\n") + adviceTip(advice[i]);
  }
  return marks;
}

}  // namespace gridbay::shell
