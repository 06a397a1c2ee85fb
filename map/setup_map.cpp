#include "map/setup_map.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <limits>

#include "basic/boundary.h"
#include "basic/grid_place.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "hydrodynamic/result.h"
#include "map/map_areas.h"
#include "map/map_names.h"
#include "map/module_outputs.h"
#include "structures/line_structure.h"

namespace gridbay {
namespace {

constexpr const char* kNoLength = "A boundary has two ends that differ";
constexpr const char* kFoundByProgram =
    "The boundaries are found by the program; choose \"User specified\" on their page first";
constexpr const char* kPlacedByHotStart = "A hot start file says itself where its area lies";

GridFrame frameOf(const GridHeader& header) {
  return {header.geography, header.firstX, header.firstY, header.dx, header.dy};
}

MapEdit made(MapFeatureId feature, std::string_view what) {
  return {.page = static_cast<PageId>(feature.page),
          .name = fmt::format("{} {}, {}", kindName(feature.kind), feature.number, what)};
}

std::string pointName(MapFeatureId feature, std::size_t vertex) {
  if (feature.kind == MapKind::boundary) return vertex == 0 ? "First point" : "Last point";
  return fmt::format("{} {}", feature.kind == MapKind::massBudget ? "Corner point" : "point", vertex + 1);
}

// What is wrong with points on grids; empty when nothing.
std::string faultOf(const GridShape& shape, MapKind kind, const std::vector<MapArea>& areas) {
  if (shape.points.empty()) return "There are no points";
  if (kind == MapKind::boundary && shape.points[0].j != shape.points[1].j &&
      shape.points[0].k != shape.points[1].k)
    return "The boundary is parallel to neither axis of the grid";
  // The border itself takes no part in a mass budget.
  const std::int32_t margin = kind == MapKind::massBudget ? 1 : 0;
  for (std::size_t i = 0; i < shape.points.size(); ++i) {
    const std::int32_t number = shape.areas[i];
    const GridPoint point = shape.points[i];
    if (number < 1 || static_cast<std::size_t>(number) > areas.size())
      return fmt::format("There is no area {}", number);
    const MapArea& area = areas[static_cast<std::size_t>(number) - 1];
    if (!area.isPlaced) return fmt::format("Area {} has no place on the map", number);
    if (point.j < margin || point.k < margin || point.j >= area.nx - margin || point.k >= area.ny - margin)
      return fmt::format("Point {} lies {} the grid of area {}, which has {} x {} points", pointText(point),
                         margin == 0 ? "outside" : "outside, or on the border of,", number, area.nx, area.ny);
    if (kind != MapKind::source) continue;
    const MapPoint place = area.grid.at(point.j, point.k);
    for (const MapArea& inner : areas) {
      if (inner.number > 1 && inner.enclosing == number && pointAt(inner, place))
        return fmt::format("Point {} of area {} is covered by area {}", pointText(point), number,
                           inner.number);
    }
  }
  return {};
}

bool isFinite(MapPoint point) {
  return std::isfinite(point.east) && std::isfinite(point.north);
}

}  // namespace

GridPoint slideAlongBorder(double j, double k, std::int32_t nx, std::int32_t ny,
                           std::optional<GridPoint> otherEnd) {
  const auto within = [](double at, std::int32_t points) {
    return std::clamp(static_cast<std::int32_t>(std::lround(std::clamp(at, -1.0, double(points)))), 0,
                      points - 1);
  };
  const GridPoint nearest{within(j, nx), within(k, ny)};
  const std::array<GridPoint, 4> candidates{
      {{0, nearest.k}, {nx - 1, nearest.k}, {nearest.j, 0}, {nearest.j, ny - 1}}};
  const auto holdsOther = [&](const GridPoint& at) {
    if (!otherEnd) return true;
    const bool alongK = (at.j == 0 || at.j == nx - 1) && otherEnd->j == at.j;
    const bool alongJ = (at.k == 0 || at.k == ny - 1) && otherEnd->k == at.k;
    return alongJ || alongK;
  };
  const bool isBound = std::ranges::any_of(candidates, holdsOther);
  GridPoint best = nearest;
  double least = std::numeric_limits<double>::max();
  for (const GridPoint& candidate : candidates) {
    const double distance = std::hypot(candidate.j - j, candidate.k - k);
    if ((isBound && !holdsOther(candidate)) || distance >= least) continue;
    least = distance;
    best = candidate;
  }
  return best;
}

const MapScene& SetupMap::scene(CGlobalKvs& root) {
  const std::string before = scene_.projectionText;
  scene_.areas = placeAreas(*root.bathymetry, headers_, coordinates_);
  scene_.projection = coordinates_.projection().Name();
  scene_.projectionText = coordinates_.projection().Wkt();
  if (scene_.projectionText != before) structures_.forget();
  scene_.features.clear();
  scene_.moduleOutputs = static_cast<std::int32_t>(moduleOutputs(root).page);
  scene_.moduleLines = scene_.moduleBoxes = 0;
  for (const LineOrBoxList* list : linesAndBoxes(root))
    (list->kind().isLine ? scene_.moduleLines : scene_.moduleBoxes) =
        static_cast<std::int32_t>(list->kind().page);
  appendOnGrids(root);
  structures_.append(root, coordinates_, scene_.areas, scene_.features);
  return scene_;
}

void SetupMap::appendOnGrids(CGlobalKvs& root) {
  for (ListedShape& listed : listedShapes(root)) {
    const std::optional<GridShape> shape = shapeOf(root, listed.id);
    if (!shape) continue;
    MapFeature feature{.id = listed.id, .label = std::move(listed.label), .drive = listed.drive};
    feature.row = listed.row;
    feature.column = listed.column;
    feature.area = shape->area();
    feature.lastArea = shape->areas.empty() ? 0 : shape->areas.back();
    feature.closed = shape->closed;
    feature.joined = shape->joined;
    feature.fault = faultOf(*shape, listed.id.kind, scene_.areas);
    auto points = std::make_shared<std::vector<MapPoint>>();
    for (std::size_t i = 0; i < shape->points.size(); ++i) {
      const MapArea* area = scene_.area(shape->areas[i]);
      if (area != nullptr && area->isPlaced)
        points->push_back(area->grid.at(shape->points[i].j, shape->points[i].k));
    }
    feature.isComplete = points->size() == shape->points.size();
    feature.points = std::move(points);
    scene_.features.push_back(std::move(feature));
  }
}

std::optional<MapPick> SetupMap::pick(MapPoint place, std::int32_t area) const {
  const std::int32_t number = area == 0 ? finestAt(scene_.areas, place) : area;
  const MapArea* picked = scene_.area(number);
  const auto point = picked == nullptr ? std::nullopt : pointAt(*picked, place);
  return point ? std::optional(MapPick{number, *point}) : std::nullopt;
}

std::optional<PickedPlace> SetupMap::placeFor(const CellPick& cell, MapPoint place) {
  if (cell.of == CellPick::Of::coordinates) {
    std::array own{place};
    if (!coordinates_.fromMap(cell.projection, own).empty() || !isFinite(own[0])) return std::nullopt;
    return PickedPlace{.x = own[0].east, .y = own[0].north};
  }
  if (cell.of == CellPick::Of::border) {
    const MapArea* area = scene_.area(cell.area);
    if (area == nullptr || !area->isPlaced) return std::nullopt;
    const auto [j, k] = area->grid.pointOf(place);
    return PickedPlace{.area = cell.area, .point = slideAlongBorder(j, k, area->nx, area->ny, {})};
  }
  const auto there = pick(place, cell.of == CellPick::Of::finest ? 0 : cell.area);
  return there ? std::optional(PickedPlace{.area = there->area, .point = there->point}) : std::nullopt;
}

std::optional<MapPoint> SetupMap::placeOf(const CellPick& cell, const PickedPlace& held) {
  if (cell.of == CellPick::Of::coordinates) {
    std::array there{MapPoint{held.x, held.y}};
    if (!coordinates_.toMap(cell.projection, there).empty() || !isFinite(there[0])) return std::nullopt;
    return there[0];
  }
  const MapArea* area = scene_.area(cell.of == CellPick::Of::finest ? held.area : cell.area);
  if (area == nullptr || !area->isPlaced) return std::nullopt;
  return area->grid.at(held.point.j, held.point.k);
}

std::optional<std::array<double, 2>> SetupMap::geographic(MapPoint place) const {
  double longitude = 0;
  double latitude = 0;
  if (coordinates_.isLocal() ||
      !coordinates_.projection().Proj2Geo(place.east, place.north, &longitude, &latitude))
    return std::nullopt;
  return std::array{longitude, latitude};
}

AreaPlace SetupMap::previewMoveArea(CGlobalKvs& root, std::int32_t number, MapPoint first) {
  return placeArea(*root.bathymetry, scene(root).areas, number, first);
}

MapEdit SetupMap::moveArea(CGlobalKvs& root, std::int32_t number, MapPoint first) {
  const AreaPlace place = previewMoveArea(root, number, first);
  if (place.nx == 0) return refusedEdit(place.fault);
  if (root.bathymetry->hotStart == 1) return refusedEdit(kPlacedByHotStart);
  root.bathymetry->at(number).origin = place.origin;
  return {.page = PageId::bathymetry, .name = fmt::format("Area {}, Origin", number)};
}

Result<AreaSnap> SetupMap::snapOf(CGlobalKvs& root, std::int32_t number) {
  const MapArea* area = scene(root).area(number);
  if (area == nullptr || number < 2)
    return Failure{fmt::format("There is no area {} in another one", number)};
  const MapArea* outer = scene_.area(area->enclosing);
  if (outer == nullptr || !outer->isPlaced)
    return Failure{fmt::format("Area {}, in which area {} is to lie, has no place on the map{}",
                               area->enclosing, number,
                               outer == nullptr || outer->fault.empty() ? "" : ": " + outer->fault)};
  if (!area->isPlaced) return Failure{area->fault};
  const GridFrame around = frameOf(headers_.of(outer->file));
  const CVdMapProjection projection(around.geography ? around.geography->projection : std::string());
  const std::optional<GridSpot> spot = spotOfGrid(frameOf(headers_.of(area->file)), around, projection);
  if (!spot)
    return Failure{
        fmt::format("The files of areas {} and {} do not both have coordinates of one kind: give the "
                    "position as J,K",
                    outer->number, number)};
  AreaSnap snap{{spot->j, spot->k}, {}};
  constexpr double kFar = 1e9;
  if (!(std::abs(snap.exact[0]) < kFar && std::abs(snap.exact[1]) < kFar))
    return Failure{fmt::format("The file of area {} lies nowhere near area {}", number, outer->number)};
  snap.nearest = {static_cast<std::int32_t>(std::lround(snap.exact[0])),
                  static_cast<std::int32_t>(std::lround(snap.exact[1]))};
  const auto offBy = [&](GridPoint point) {
    return std::hypot((point.j - spot->j) * outer->dx, (point.k - spot->k) * outer->dy);
  };
  snap.offBy = offBy(snap.nearest);
  snap.heldOffBy = offBy(area->origin);
  return snap;
}

AreaPlace SetupMap::previewNestedArea(CGlobalKvs& root, MapPoint corner, MapPoint opposite) {
  return placeNewArea(*root.bathymetry, scene(root).areas, corner, opposite);
}

std::string SetupMap::noMoreAreas(const CGlobalKvs& root) {
  if (theEdition.wetlandSweepKit) return "This edition has one area";
  if (root.bathymetry->overlandSolver) return "With the overland solver there is one area";
  if (root.bathymetry->hotStart == 1) return kPlacedByHotStart;
  if (root.bathymetry->GetCount() < CBathymetryKvs::kMostAreas) return {};
  return fmt::format("A setup has no more than {} areas", CBathymetryKvs::kMostAreas);
}

MapEdit SetupMap::addArea(CGlobalKvs& root, std::int32_t enclosing, GridPoint origin,
                          const std::string& file) {
  if (std::string fault = noMoreAreas(root); !fault.empty()) return refusedEdit(std::move(fault));
  CBathymetryKvs& areas = *root.bathymetry;
  const int number = areas.GetCount() + 1;
  areas.SetNoAreas(number);
  CBathymetryObjectKvs& area = areas.at(number);
  area.enclosingArea = enclosing;
  area.origin = origin;
  area.fileName = file;
  return {.page = PageId::bathymetry, .name = fmt::format("New area {}", number)};
}

SetupMap::Shaped SetupMap::shaped(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex,
                                  MapPoint place) {
  Shaped result;
  std::optional<GridShape> shape = shapeOf(root, feature);
  if (!shape || vertex >= shape->points.size()) {
    result.fault = fmt::format("{} {} has no point {}", kindName(feature.kind), feature.number, vertex + 1);
    return result;
  }
  std::vector<GridPoint>& points = shape->points;
  // A source goes to the finest area there; what belongs to one area stays in it.
  if (feature.kind == MapKind::source) {
    const auto there = pick(place, 0);
    if (!there) {
      result.fault = "There is no area";
      return result;
    }
    shape->areas[vertex] = there->area;
    points[vertex] = there->point;
  } else {
    const MapArea* area = scene_.area(shape->area());
    if (area == nullptr || !area->isPlaced) {
      result.fault = fmt::format("Area {} has no place on the map", shape->area());
      return result;
    }
    const auto [j, k] = area->grid.pointOf(place);
    if (feature.kind == MapKind::boundary) {
      const GridPoint end = slideAlongBorder(j, k, area->nx, area->ny, points[1 - vertex]);
      if (end == points[1 - vertex]) {
        result.fault = kNoLength;
        return result;
      }
      points[vertex] = end;
    } else {
      const auto point = pointAt(*area, place);
      if (!point) {
        result.fault = fmt::format("Area {} does not reach there", area->number);
        return result;
      }
      points[vertex] = *point;
      // An output along a line follows the axis along which it is longer.
      if (feature.kind == MapKind::outputLine) {
        points[vertex] = alongAxis(points[1 - vertex], *point);
      }
    }
  }
  result.point = points[vertex];
  if (feature.kind == MapKind::outputMap || feature.kind == MapKind::box)
    points = rectangleOf(points[vertex], points[(vertex + 2) % points.size()]);
  result.shape = std::move(*shape);
  result.fault = faultOf(result.shape, feature.kind, scene_.areas);
  return result;
}

VertexPlace SetupMap::previewVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex,
                                    MapPoint place) {
  scene(root);
  if (isStructure(feature.kind)) return {place, std::nullopt, {}};
  Shaped result = shaped(root, feature, vertex, place);
  if (result.shape.points.empty()) return {place, std::nullopt, result.fault};
  if (feature.kind == MapKind::boundary && !root.boundary->isUserSpecified()) result.fault = kFoundByProgram;
  const std::int32_t number =
      feature.kind == MapKind::source ? result.shape.areas[vertex] : result.shape.area();
  return {scene_.area(number)->grid.at(result.point.j, result.point.k), result.point, result.fault};
}

MapEdit SetupMap::moveVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place) {
  scene(root);
  if (isStructure(feature.kind)) {
    if (feature.number < 1 || feature.number > structureCount(root, feature.kind))
      return refusedEdit(fmt::format("There is no {} {}", kindName(feature.kind), feature.number));
    const StructureLine line = structureLine(root, feature.kind, feature.number);
    if (vertex >= line.points.size())
      return refusedEdit(fmt::format("\"{}\" has no point {}", line.name, vertex + 1));
    std::vector<MapPoint> own{place};
    if (const std::string fault = coordinates_.fromMap(line.projection, own); !fault.empty())
      return refusedEdit(fmt::format("\"{}\" {}", line.name, fault));
    if (!isFinite(own.front()))
      return refusedEdit(fmt::format("The projection of \"{}\" does not reach there", line.name));
    moveStructurePoint(root, feature.kind, feature.number, vertex, own.front());
    return made(feature, pointName(feature, vertex));
  }
  if (feature.kind == MapKind::boundary && !root.boundary->isUserSpecified())
    return refusedEdit(kFoundByProgram);
  const Shaped result = shaped(root, feature, vertex, place);
  if (result.shape.points.empty()) return refusedEdit(result.fault);
  giveShape(root, feature, result.shape);
  return made(feature, pointName(feature, vertex));
}

MapEdit SetupMap::insertVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place) {
  scene(root);
  return insertPoint(root, feature, vertex, place);
}

MapEdit SetupMap::insertPoint(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex, MapPoint place) {
  if (isStructure(feature.kind)) {
    if (feature.number < 1 || feature.number > structureCount(root, feature.kind))
      return refusedEdit(fmt::format("There is no {} {}", kindName(feature.kind), feature.number));
    const StructureLine line = structureLine(root, feature.kind, feature.number);
    if (vertex > line.points.size())
      return refusedEdit(fmt::format("\"{}\" has {} points", line.name, line.points.size()));
    if (feature.kind != MapKind::dike && line.points.size() >= LineStructure::kMostPoints)
      return refusedEdit(fmt::format("A line has no more than {} points", LineStructure::kMostPoints));
    std::vector<MapPoint> own{place};
    if (const std::string fault = coordinates_.fromMap(line.projection, own); !fault.empty())
      return refusedEdit(fmt::format("\"{}\" {}", line.name, fault));
    if (!isFinite(own.front()))
      return refusedEdit(fmt::format("The projection of \"{}\" does not reach there", line.name));
    insertStructurePoint(root, feature.kind, feature.number, vertex, own.front());
    return made(feature, "new point");
  }
  std::optional<GridShape> shape = shapeOf(root, feature);
  if (!shape || !shapeRule(feature.kind).canGrow || shape->joined == (feature.kind == MapKind::outputPoints))
    return refusedEdit(fmt::format("{} {} takes no further points", kindName(feature.kind), feature.number));
  if (feature.kind == MapKind::outputPoints) {
    const bool isOfFlow = feature.page == static_cast<std::int32_t>(PageId::hdResult);
    const auto* output = isOfFlow ? root.nhdResult->outputs.GetItem(feature.number) : nullptr;
    if (output == nullptr || output->type != CNhdResultObjectKvs::kPoints)
      return refusedEdit("An output of ranges has no further points");
  }
  const MapArea* area = scene_.area(shape->area());
  const auto point = area == nullptr ? std::nullopt : pointAt(*area, place);
  if (!point) return refusedEdit(fmt::format("Area {} does not reach there", shape->area()));
  const std::size_t before = std::min(vertex, shape->points.size());
  const std::int32_t number = shape->area();
  shape->points.insert(shape->points.begin() + static_cast<std::ptrdiff_t>(before), *point);
  shape->areas.assign(shape->points.size(), number);
  giveShape(root, feature, *shape);
  return made(feature, "new point");
}

MapEdit SetupMap::removeVertex(CGlobalKvs& root, MapFeatureId feature, std::size_t vertex) {
  const ShapeRule rule = shapeRule(feature.kind);
  const auto tooFew = [&] {
    return refusedEdit(
        fmt::format("{} {} keeps {} points at least", kindName(feature.kind), feature.number, rule.least));
  };
  if (isStructure(feature.kind)) {
    if (feature.number < 1 || feature.number > structureCount(root, feature.kind))
      return refusedEdit(fmt::format("There is no {} {}", kindName(feature.kind), feature.number));
    const std::size_t count = structureLine(root, feature.kind, feature.number).points.size();
    if (vertex >= count) return refusedEdit(fmt::format("There is no point {}", vertex + 1));
    if (count <= rule.least) return tooFew();
    removeStructurePoint(root, feature.kind, feature.number, vertex);
    return made(feature, "point removed");
  }
  std::optional<GridShape> shape = shapeOf(root, feature);
  if (!shape || vertex >= shape->points.size())
    return refusedEdit(
        fmt::format("{} {} has no point {}", kindName(feature.kind), feature.number, vertex + 1));
  if (!rule.canGrow || shape->points.size() <= rule.least) return tooFew();
  shape->points.erase(shape->points.begin() + static_cast<std::ptrdiff_t>(vertex));
  shape->areas.pop_back();
  giveShape(root, feature, *shape);
  return made(feature, "point removed");
}

}  // namespace gridbay
