#include "map/map_areas.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <numbers>

#include "basic/nesting.h"

namespace gridbay {
namespace {

MapPoint scaled(MapPoint step, double factor) {
  return {step.east * factor, step.north * factor};
}

// An area's object as it would be with what the map knows of its grid, for the rules of nesting.
class Probe {
 public:
  Probe(const MapArea& area, std::string_view fileName) : object_(nullptr) {
    object_.origin = area.origin;
    object_.enclosingArea = area.enclosing;
    object_.noJ = area.nx;
    object_.noK = area.ny;
    object_.dx = static_cast<float>(area.dx);
    object_.dy = static_cast<float>(area.dy);
    object_.fileName = fileName;
  }
  const CBathymetryObjectKvs& object() const { return object_; }

 private:
  CBathymetryObjectKvs object_;
};

std::string nameOf(const CBathymetryKvs& setup, std::int32_t number) {
  const CBathymetryObjectKvs* area = setup.GetItem(number);
  return area == nullptr ? std::string() : area->fileName.text();
}

// The first rule that an area breaks where it lies; empty when none.
std::string nestingFault(const CBathymetryKvs& setup, const std::vector<MapArea>& areas,
                         const MapArea& area) {
  ValidationList messages;
  const Probe inner(area, nameOf(setup, area.number));
  const MapArea& outer = areas[static_cast<std::size_t>(area.enclosing) - 1];
  CheckNestingGeometry(inner.object(), Probe(outer, nameOf(setup, outer.number)).object(), messages);
  for (const MapArea& other : areas) {
    const bool isBeside = other.number != area.number && other.number > 1 && other.isPlaced &&
                          other.enclosing == area.enclosing;
    if (isBeside) CheckOverlap(inner.object(), Probe(other, nameOf(setup, other.number)).object(), messages);
  }
  return messages.empty() ? std::string() : messages.front().text;
}

void placeOuter(MapArea& area, const GridHeader& header, MapCoordinates& coordinates) {
  const bool hasPlace = header.geography && !CVdMapProjection::IsLocal(header.geography->projection);
  coordinates.setProjection(hasPlace ? header.geography->projection : std::string());
  MapPoint first{header.firstX, header.firstY};
  if (hasPlace) {
    const TsbGeography& place = *header.geography;
    const auto found = coordinates.placeOf(place.projection, place.longitude, place.latitude);
    if (!found) {
      area.fault =
          fmt::format("The projection of \"{}\" can't hold the place that the file names", area.file);
      return;
    }
    first = *found;
    area.rotation = place.rotation;
  }
  const double angle = area.rotation * std::numbers::pi / 180;
  area.grid = {first,
               {area.dx * std::cos(angle), -area.dx * std::sin(angle)},
               {area.dy * std::sin(angle), area.dy * std::cos(angle)}};
  area.isPlaced = true;
}

void placeInner(MapArea& area, const MapArea& outer, const GridHeader& header, MapCoordinates& coordinates) {
  area.level = outer.level + 1;
  area.rotation = outer.rotation;
  area.grid = gridWithin(outer, area.origin, area.dx, area.dy);
  area.isPlaced = true;
  if (const auto there = ownPlace(header, coordinates))
    area.offBy = std::hypot(there->east - area.grid.first.east, there->north - area.grid.first.north);
}

// The range in which the origin of an area of so many points along an edge lies inside; its ends change
// places where the area is too long for it.
std::int32_t inside(double wanted, std::int32_t points, std::int32_t outerPoints) {
  const std::int32_t most = std::max(1, outerPoints - 2 - (points - 1) / kNestingRatio);
  return static_cast<std::int32_t>(std::clamp(std::round(wanted), 1.0, double{static_cast<double>(most)}));
}

}  // namespace

std::array<MapPoint, 4> cornersOf(const MapGrid& grid, int nx, int ny) {
  constexpr double kHalf = 0.5;
  return {grid.at(-kHalf, -kHalf), grid.at(nx - kHalf, -kHalf), grid.at(nx - kHalf, ny - kHalf),
          grid.at(-kHalf, ny - kHalf)};
}

MapGrid gridWithin(const MapArea& outer, GridPoint origin, double dx, double dy) {
  return {outer.grid.at(origin.j, origin.k), scaled(outer.grid.stepJ, dx / outer.dx),
          scaled(outer.grid.stepK, dy / outer.dy)};
}

bool nestsIn(const MapArea& inner, const MapArea& outer) {
  ValidationList messages;
  return CheckNestingGeometry(Probe(inner, {}).object(), Probe(outer, {}).object(), messages) == 0;
}

std::optional<MapPoint> ownPlace(const GridHeader& header, MapCoordinates& coordinates) {
  const bool isLocal = !header.geography || CVdMapProjection::IsLocal(header.geography->projection);
  if (isLocal != coordinates.isLocal()) return std::nullopt;
  if (!isLocal)
    return coordinates.placeOf(header.geography->projection, header.geography->longitude,
                               header.geography->latitude);
  // Axes that begin at 0 say nothing.
  if (header.firstX == 0 && header.firstY == 0) return std::nullopt;
  return MapPoint{header.firstX, header.firstY};
}

std::vector<MapArea> placeAreas(const CBathymetryKvs& setup, GridHeaders& headers,
                                MapCoordinates& coordinates) {
  std::vector<MapArea> areas;
  std::vector<const GridHeader*> read;
  for (int number = 1; number <= setup.GetCount(); ++number) {
    const CBathymetryObjectKvs& object = *setup.GetItem(number);
    MapArea area{.number = number, .file = object.fileName.absolute(), .item = setup.hotStart == 1 ? 2 : 1};
    area.origin = object.origin;
    area.enclosing = number == 1 ? 0 : object.enclosingArea;
    const GridHeader* header = area.file.empty() ? nullptr : &headers.of(area.file);
    if (header == nullptr) {
      area.fault = fmt::format("Area {} has no grid file", number);
    } else {
      area.fileState = header->state;
      area.fault = header->fault;
    }
    if (header != nullptr && header->fault.empty()) {
      area.nx = header->nx;
      area.ny = header->ny;
      area.dx = header->dx;
      area.dy = header->dy;
      area.landValue = header->landValue;
    }
    areas.push_back(std::move(area));
    read.push_back(header);
  }
  if (areas.empty() || !areas.front().fault.empty()) coordinates.setProjection({});
  // Each pass places what lies in what the passes before have placed.
  for (bool goesOn = true; goesOn;) {
    goesOn = false;
    for (MapArea& area : areas) {
      if (area.isPlaced || !area.fault.empty()) continue;
      const GridHeader& header = *read[static_cast<std::size_t>(area.number) - 1];
      const bool isNumber = area.enclosing >= 1 && static_cast<std::size_t>(area.enclosing) <= areas.size();
      if (area.number == 1) {
        placeOuter(area, header, coordinates);
      } else if (isNumber && areas[static_cast<std::size_t>(area.enclosing) - 1].isPlaced) {
        placeInner(area, areas[static_cast<std::size_t>(area.enclosing) - 1], header, coordinates);
      }
      goesOn = goesOn || area.isPlaced;
    }
  }
  for (MapArea& area : areas) {
    if (area.isPlaced) {
      area.corners = cornersOf(area.grid, area.nx, area.ny);
      if (area.number > 1) area.fault = nestingFault(setup, areas, area);
    } else if (area.fault.empty()) {
      area.fault = fmt::format("Area {} can't be placed in area {}, in which it is said to lie", area.number,
                               area.enclosing);
    }
  }
  return areas;
}

std::optional<GridPoint> pointAt(const MapArea& area, MapPoint place) {
  if (!area.isPlaced) return std::nullopt;
  const auto [j, k] = area.grid.pointOf(place);
  constexpr double kHalf = 0.5;
  const bool isInside = j >= -kHalf && k >= -kHalf && j <= area.nx - kHalf && k <= area.ny - kHalf;
  if (!isInside) return std::nullopt;
  const auto nearest = [](double at, std::int32_t points) {
    return std::clamp(static_cast<std::int32_t>(std::lround(at)), 0, points - 1);
  };
  return GridPoint{nearest(j, area.nx), nearest(k, area.ny)};
}

std::int32_t finestAt(const std::vector<MapArea>& areas, MapPoint place) {
  const MapArea* finest = nullptr;
  for (const MapArea& area : areas) {
    if (pointAt(area, place) && (finest == nullptr || area.level >= finest->level)) finest = &area;
  }
  return finest == nullptr ? 0 : finest->number;
}

AreaPlace placeArea(const CBathymetryKvs& setup, const std::vector<MapArea>& areas, std::int32_t number,
                    MapPoint first) {
  AreaPlace place;
  const bool isThere = number >= 2 && static_cast<std::size_t>(number) <= areas.size();
  if (!isThere || !areas[static_cast<std::size_t>(number) - 1].isPlaced) {
    place.fault = number == 1 ? "Area 1 lies where its file says"
                              : fmt::format("Area {} has no place on the map", number);
    return place;
  }
  MapArea moved = areas[static_cast<std::size_t>(number) - 1];
  const MapArea& outer = areas[static_cast<std::size_t>(moved.enclosing) - 1];
  const auto [j, k] = outer.grid.pointOf(first);
  moved.origin = {inside(j, moved.nx, outer.nx), inside(k, moved.ny, outer.ny)};
  moved.grid = gridWithin(outer, moved.origin, moved.dx, moved.dy);
  place.enclosing = moved.enclosing;
  place.origin = moved.origin;
  place.nx = moved.nx;
  place.ny = moved.ny;
  place.grid = moved.grid;
  place.corners = cornersOf(moved.grid, moved.nx, moved.ny);
  place.fault = nestingFault(setup, areas, moved);
  return place;
}

AreaPlace placeNewArea(const CBathymetryKvs& setup, const std::vector<MapArea>& areas, MapPoint corner,
                       MapPoint opposite) {
  AreaPlace place;
  const MapArea* outer = nullptr;
  for (const MapArea& area : areas) {
    const bool holds = pointAt(area, corner) && pointAt(area, opposite);
    if (holds && (outer == nullptr || area.level >= outer->level)) outer = &area;
  }
  if (outer == nullptr) {
    place.fault = "No area holds the whole rectangle";
    return place;
  }
  const GridPoint a = *pointAt(*outer, corner);
  const GridPoint b = *pointAt(*outer, opposite);
  const auto clampedTo = [](std::int32_t at, std::int32_t points) {
    return std::clamp(at, 1, std::max(1, points - 2));
  };
  const GridPoint first{clampedTo(std::min(a.j, b.j), outer->nx), clampedTo(std::min(a.k, b.k), outer->ny)};
  const GridPoint last{clampedTo(std::max(a.j, b.j), outer->nx), clampedTo(std::max(a.k, b.k), outer->ny)};
  MapArea area{.number = static_cast<std::int32_t>(areas.size()) + 1};
  area.origin = first;
  area.enclosing = outer->number;
  area.nx = kNestingRatio * (last.j - first.j) + 1;
  area.ny = kNestingRatio * (last.k - first.k) + 1;
  area.dx = outer->dx / kNestingRatio;
  area.dy = outer->dy / kNestingRatio;
  area.grid = gridWithin(*outer, first, area.dx, area.dy);
  place = {
      area.enclosing, area.origin, area.nx, area.ny, area.grid, cornersOf(area.grid, area.nx, area.ny), {}};
  if (last.j <= first.j || last.k <= first.k) {
    place.fault = "The rectangle is smaller than a cell of the area around it";
  } else if (setup.GetCount() >= CBathymetryKvs::kMostAreas) {
    place.fault = fmt::format("A setup has no more than {} areas", CBathymetryKvs::kMostAreas);
  } else {
    place.fault = nestingFault(setup, areas, area);
  }
  return place;
}

}  // namespace gridbay
