#include "map/structure_lines.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

#include "map/map_areas.h"
#include "setup/entry_removal.h"
#include "structures/culvert.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

// Calls with the structure's points as what weirs and culverts have in common, or as a dike.
template <class OnLine, class OnDike>
auto withStructure(CGlobalKvs& root, MapKind kind, int number, OnLine onLine, OnDike onDike) {
  if (kind == MapKind::dike) return onDike(root.nhdDike->at(number));
  LineStructure& line = kind == MapKind::weir ? static_cast<LineStructure&>(root.nhdWeir->at(number))
                                              : static_cast<LineStructure&>(root.nhdCulvert->at(number));
  return onLine(line);
}

std::size_t pointCount(const LineStructure& line) {
  return std::min(line.x.size(), line.y.size());
}

std::vector<MapPoint> pointsOf(const LineStructure& line) {
  std::vector<MapPoint> points(pointCount(line));
  for (std::size_t i = 0; i < points.size(); ++i) points[i] = {line.x[i], line.y[i]};
  return points;
}

std::vector<MapPoint> pointsOf(const SharedArray<DikePoint>& dike) {
  std::vector<MapPoint> points;
  points.reserve(dike.size());
  for (std::size_t block = 0; block < dike.blockCount(); ++block) {
    for (const DikePoint& point : dike.block(block)) points.push_back({point.x, point.y});
  }
  return points;
}

std::ptrdiff_t at(std::size_t vertex) {
  return static_cast<std::ptrdiff_t>(vertex);
}

// Whether a line has a part in an area, its points perhaps outside: in columns and rows of the grid a segment
// is cut off at the four edges, and something of it is left.
bool touches(const MapArea& area, const std::vector<MapPoint>& line) {
  constexpr double kHalf = 0.5;
  const std::array<double, 2> most{area.nx - kHalf, area.ny - kHalf};
  for (std::size_t i = 0; i < line.size(); ++i) {
    const std::array<double, 2> from = area.grid.pointOf(line[i]);
    const std::array<double, 2> to = area.grid.pointOf(line[i + 1 < line.size() ? i + 1 : i]);
    double first = 0;
    double last = 1;
    for (std::size_t along = 0; along < 2; ++along) {
      const double way = to[along] - from[along];
      double enters = (-kHalf - from[along]) / way;
      double leaves = (most[along] - from[along]) / way;
      if (way == 0) {
        const bool isBetween = from[along] >= -kHalf && from[along] <= most[along];
        enters = isBetween ? 0 : 2;
        leaves = 1;
      }
      if (enters > leaves && way != 0) std::swap(enters, leaves);
      first = std::max(first, enters);
      last = std::min(last, leaves);
    }
    if (first <= last) return true;
  }
  return false;
}

constexpr MapKind kStructures[] = {MapKind::dike, MapKind::weir, MapKind::culvert};

}  // namespace

bool isStructure(MapKind kind) {
  return std::ranges::find(kStructures, kind) != std::end(kStructures);
}

PageId pageOfStructure(MapKind kind) {
  if (kind == MapKind::dike) return PageId::dikes;
  return kind == MapKind::weir ? PageId::weirs : PageId::culverts;
}

int structureCount(CGlobalKvs& root, MapKind kind) {
  if (kind == MapKind::dike) return root.nhdDike->GetCount();
  return kind == MapKind::weir ? root.nhdWeir->GetCount() : root.nhdCulvert->GetCount();
}

void setStructureCount(CGlobalKvs& root, MapKind kind, int count) {
  if (kind == MapKind::dike) root.nhdDike->SetCount(count);
  if (kind == MapKind::weir) root.nhdWeir->SetCount(count);
  if (kind == MapKind::culvert) root.nhdCulvert->SetCount(count);
}

StructureLine structureLine(CGlobalKvs& root, MapKind kind, int number) {
  return withStructure(
      root, kind, number,
      [](const LineStructure& line) {
        return StructureLine{line.name, line.coordinateType, pointsOf(line)};
      },
      [](const CNhdDikeObjectKvs& dike) {
        return StructureLine{dike.name, dike.coordinateType, pointsOf(dike.points)};
      });
}

void giveProjection(CGlobalKvs& root, MapKind kind, int number, const std::string& projection) {
  withStructure(
      root, kind, number, [&](LineStructure& line) { line.coordinateType = projection; },
      [&](CNhdDikeObjectKvs& dike) { dike.coordinateType = projection; });
}

void moveStructurePoint(CGlobalKvs& root, MapKind kind, int number, std::size_t vertex, MapPoint place) {
  withStructure(
      root, kind, number,
      [&](LineStructure& line) {
        line.x.at(vertex) = place.east;
        line.y.at(vertex) = place.north;
      },
      [&](CNhdDikeObjectKvs& dike) {
        DikePoint& point = dike.points.edit(vertex);
        point.x = place.east;
        point.y = place.north;
      });
}

void insertStructurePoint(CGlobalKvs& root, MapKind kind, int number, std::size_t vertex, MapPoint place) {
  withStructure(
      root, kind, number,
      [&](LineStructure& line) {
        const std::size_t count = pointCount(line);
        line.x.resize(count);
        line.y.resize(count);
        line.x.insert(line.x.begin() + at(vertex), place.east);
        line.y.insert(line.y.begin() + at(vertex), place.north);
      },
      [&](CNhdDikeObjectKvs& dike) {
        SharedArray<DikePoint>& points = dike.points;
        const double level = points.empty() ? dike.crestLevel : points[vertex == 0 ? 0 : vertex - 1].z;
        points.push_back({});
        for (std::size_t i = points.size() - 1; i > vertex; --i) points.edit(i) = DikePoint(points[i - 1]);
        points.edit(vertex) = {place.east, place.north, level};
      });
}

void removeStructurePoint(CGlobalKvs& root, MapKind kind, int number, std::size_t vertex) {
  withStructure(
      root, kind, number,
      [&](LineStructure& line) {
        line.x.erase(line.x.begin() + at(vertex));
        line.y.erase(line.y.begin() + at(vertex));
      },
      [&](CNhdDikeObjectKvs& dike) {
        SharedArray<DikePoint>& points = dike.points;
        for (std::size_t i = vertex + 1; i < points.size(); ++i) points.edit(i - 1) = DikePoint(points[i]);
        points.resize(points.size() - 1);
      });
}

void removeStructure(CGlobalKvs& root, MapKind kind, int number) {
  if (kind == MapKind::dike) removeEntry(*root.nhdDike, number);
  if (kind == MapKind::weir) removeEntry(*root.nhdWeir, number);
  if (kind == MapKind::culvert) removeEntry(*root.nhdCulvert, number);
}

void StructureLines::place(Known& known, const std::vector<MapPoint>& own, MapCoordinates& coordinates) {
  auto points = std::make_shared<std::vector<MapPoint>>(own);
  known.fault = coordinates.toMap(known.projection, *points);
  const auto isLost = [](const MapPoint& point) {
    return !std::isfinite(point.east) || !std::isfinite(point.north);
  };
  if (!known.fault.empty()) {
    points->clear();
  } else if (std::erase_if(*points, isLost) > 0) {
    known.fault = "has points that the projection of Area 1 can't hold";
  } else if (points->size() < 2) {
    known.fault = "has fewer than two points";
  }
  known.line = std::move(points);
  known.outerNx = known.fault.empty() ? -1 : 0;
}

// All areas lie in Area 1, so that a line outside it is outside all of them.
void StructureLines::check(Known& known, const std::vector<MapArea>& areas) {
  if (areas.empty() || !areas.front().isPlaced || known.outerNx == 0) return;
  const MapArea& outer = areas.front();
  if (known.outer == outer.grid && known.outerNx == outer.nx && known.outerNy == outer.ny) return;
  known.outer = outer.grid;
  known.outerNx = outer.nx;
  known.outerNy = outer.ny;
  known.fault = touches(outer, *known.line) ? "" : "lies outside all areas";
}

void StructureLines::append(CGlobalKvs& root, MapCoordinates& coordinates, const std::vector<MapArea>& areas,
                            std::vector<MapFeature>& features) {
  for (const MapKind kind : kStructures) {
    const int count = structureCount(root, kind);
    for (int number = 1; number <= count; ++number) {
      Known& known = known_[{kind, number}];
      MapFeature feature;
      feature.id = {kind, number, static_cast<std::int32_t>(pageOfStructure(kind))};
      feature.row = number;
      std::size_t pointsOfOwn = 0;
      withStructure(
          root, kind, number,
          [&](const LineStructure& line) {
            feature.label = line.name;
            pointsOfOwn = pointCount(line);
            if (known.line && known.projection == line.coordinateType && known.x == line.x &&
                known.y == line.y)
              return;
            known = {.projection = line.coordinateType, .x = line.x, .y = line.y};
            place(known, pointsOf(line), coordinates);
          },
          [&](const CNhdDikeObjectKvs& dike) {
            feature.label = dike.name;
            pointsOfOwn = dike.points.size();
            if (dike.include == 0) feature.drive = MapDrive::off;
            if (known.line && known.projection == dike.coordinateType && known.dike == dike.points) return;
            known = {.projection = dike.coordinateType, .dike = dike.points};
            place(known, pointsOf(dike.points), coordinates);
          });
      check(known, areas);
      feature.points = known.line;
      feature.isComplete = feature.points->size() == pointsOfOwn;
      if (!known.fault.empty()) feature.fault = fmt::format("\"{}\" {}", feature.label, known.fault);
      features.push_back(std::move(feature));
    }
  }
}

}  // namespace gridbay
