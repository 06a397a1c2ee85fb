// What is drawn on the map, and removed there.

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <span>

#include "basic/boundary.h"
#include "basic/boundary_overlap.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "hydrodynamic/result.h"
#include "map/map_areas.h"
#include "map/map_names.h"
#include "map/module_outputs.h"
#include "map/setup_map.h"
#include "structures/line_structure.h"

namespace gridbay {
namespace {

MapFeatureId idOf(MapKind kind, int number, PageId page) {
  return {kind, number, static_cast<std::int32_t>(page)};
}

constexpr std::array kOutputs{MapKind::outputMap, MapKind::outputLine, MapKind::outputPoints};

bool isOutput(MapKind kind) {
  return std::ranges::find(kOutputs, kind) != kOutputs.end();
}

bool isFlowPage(std::int32_t page) {
  return page == 0 || page == static_cast<std::int32_t>(PageId::hdResult);
}

bool isRectangle(MapKind kind) {
  return kind == MapKind::outputMap || kind == MapKind::box;
}

// Two points as the ends of what a feature covers: an output along a line follows the axis along which it is
// longer. What is wrong, or empty.
std::string makeExtent(MapKind kind, GridPoint first, GridPoint& last) {
  if (isRectangle(kind) && (first.j == last.j || first.k == last.k))
    return "The rectangle is narrower than the grid's cells";
  if (kind == MapKind::outputLine) last = alongAxis(first, last);
  if ((kind == MapKind::outputLine || kind == MapKind::discharge) && first == last)
    return "The line is shorter than the grid's cells";
  return {};
}

// The boundaries over which one would lie; a point in common is not yet that.
std::vector<int> boundariesBelow(const CBoundaryKvs& list, GridPoint first, GridPoint last) {
  CBoundaryObjectKvs drawn(nullptr);
  drawn.first = first;
  drawn.last = last;
  std::vector<int> below;
  for (int number = 1; number <= list.GetCount(); ++number) {
    const auto common = commonOf(*list.GetItem(number), drawn);
    if (common && common->low < common->high) below.push_back(number);
  }
  return below;
}

std::string faultBelow(const std::vector<int>& below) {
  return below.size() < 2 ? std::string()
                          : fmt::format("It lies over boundaries {}: draw it over one of them at most",
                                        fmt::join(below, " and "));
}

}  // namespace

MapEdit SetupMap::addFeature(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points,
                             std::int32_t page) {
  scene(root);
  if (kind == MapKind::discharge || kind == MapKind::box) return addLineOrBox(root, kind, points);
  if (kind == MapKind::boundary) return addBoundary(root, points);
  if (isOutput(kind) && !isFlowPage(page)) return addModuleOutput(root, kind, points);
  return isStructure(kind) ? addStructure(root, kind, points) : addOnGrid(root, kind, points);
}

MapEdit SetupMap::addStructure(CGlobalKvs& root, MapKind kind, std::vector<MapPoint> points) {
  const int number = structureCount(root, kind) + 1;
  if (points.size() < 2) return refusedEdit("A line has two points at least");
  if (number > LineStructure::kMost)
    return refusedEdit(fmt::format("There are no more than {} of them", LineStructure::kMost));
  if (kind != MapKind::dike && points.size() > LineStructure::kMostPoints)
    return refusedEdit(fmt::format("A line has no more than {} points", LineStructure::kMostPoints));
  setStructureCount(root, kind, number);
  // A new one stands in the projection of the map, whatever that of the setup's other structures is.
  const std::string local = CVdMapProjection::IDtoProjectionString(1);
  giveProjection(root, kind, number,
                 coordinates_.isLocal() ? local : coordinates_.projection().GetProjectionString());
  for (std::size_t i = structureLine(root, kind, number).points.size(); i > 0; --i)
    removeStructurePoint(root, kind, number, i - 1);
  for (std::size_t i = 0; i < points.size(); ++i) insertStructurePoint(root, kind, number, i, points[i]);
  return {.page = pageOfStructure(kind), .name = fmt::format("New {}", kindName(kind))};
}

SetupMap::NewShape SetupMap::newShape(MapKind kind, const std::vector<MapPoint>& points,
                                      bool isOfFlow) const {
  NewShape made;
  auto& [on, areas, closed, joined] = made.shape;
  const auto failed = [&made](std::string fault) {
    made.fault = std::move(fault);
    return made;
  };
  if (points.empty()) return failed("There are no points");
  if (kind == MapKind::boundary) {
    const MapArea* area = scene_.area(1);
    if (area == nullptr || !area->isPlaced) return failed("Area 1 has no place on the map");
    for (const MapPoint& point : std::span(points).first(std::min<std::size_t>(points.size(), 2))) {
      const auto [j, k] = area->grid.pointOf(point);
      on.push_back(
          slideAlongBorder(j, k, area->nx, area->ny, on.empty() ? std::nullopt : std::optional(on.front())));
    }
    areas.assign(on.size(), 1);
    if (on.size() == 2 && on[0] == on[1]) made.fault = "The boundary is shorter than the spacing of Area 1";
    return made;
  }
  if (kind == MapKind::source) {
    for (const MapPoint& point : points) {
      const auto there = pick(point, 0);
      if (!there) return failed("There is no area");
      on.push_back(there->point);
      areas.push_back(there->area);
    }
    return made;
  }
  const auto isInArea1 = [this](MapPoint point) { return pick(point, 1).has_value(); };
  if (isOfFlow && !std::ranges::all_of(points, isInArea1)) return failed("Area 1 does not reach there");
  const std::int32_t number = isOfFlow ? 1 : finestHolding(points);
  if (number == 0) {
    const char* what = kind == MapKind::massBudget  ? "polygon"
                       : kind == MapKind::discharge ? "line"
                       : kind == MapKind::box       ? "box"
                                                    : "output";
    return failed(fmt::format("No area holds the whole {}", what));
  }
  for (const MapPoint& point : points) on.push_back(pick(point, number)->point);
  const bool hasExtent = isRectangle(kind) || kind == MapKind::outputLine || kind == MapKind::discharge;
  if (hasExtent && on.size() > 1) {
    const GridPoint first = on.front();
    GridPoint last = on.back();
    made.fault = makeExtent(kind, first, last);
    on = isRectangle(kind) ? rectangleOf(first, last) : std::vector<GridPoint>{first, last};
  }
  areas.assign(on.size(), number);
  closed = isRectangle(kind) || kind == MapKind::massBudget;
  return made;
}

FeaturePlace SetupMap::previewFeature(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points,
                                      std::int32_t page) const {
  if (isStructure(kind)) return {points, {}, {}};
  const NewShape made = newShape(kind, points, isOutput(kind) && isFlowPage(page));
  FeaturePlace place{{}, {}, made.fault};
  const std::vector<GridPoint>& on = made.shape.points;
  if (made.fault.empty() && kind == MapKind::boundary && on.size() == 2)
    place.fault = faultBelow(boundariesBelow(*root.boundary, on[0], on[1]));
  for (std::size_t i = 0; i < on.size() && i < made.shape.areas.size(); ++i)
    place.points.push_back(scene_.area(made.shape.areas[i])->grid.at(on[i].j, on[i].k));
  if (place.points.empty()) {
    place.points = points;
  } else {
    place.point = isRectangle(kind) && on.size() > 2 ? on[2] : on.back();
  }
  return place;
}

// What the program has found stays, and is the user's from now on. What is said of a boundary on other pages
// stands under its number, so that one which is drawn over another has the number of that.
MapEdit SetupMap::addBoundary(CGlobalKvs& root, const std::vector<MapPoint>& points) {
  CBoundaryKvs& list = *root.boundary;
  const NewShape made = newShape(MapKind::boundary, points, false);
  if (!made.fault.empty()) return refusedEdit(made.fault);
  if (points.size() < 2) return refusedEdit("2 points are needed");
  const GridPoint first = made.shape.points[0];
  const GridPoint last = made.shape.points[1];
  const std::vector<int> below = boundariesBelow(list, first, last);
  if (std::string fault = faultBelow(below); !fault.empty()) return refusedEdit(std::move(fault));
  if (below.empty() && list.GetCount() >= CBoundaryKvs::kMostOnPage)
    return refusedEdit(fmt::format("There are no more than {} boundaries", CBoundaryKvs::kMostOnPage));
  list.defaultPosition = 0;
  if (below.empty()) list.SetNoBoundaries(list.GetCount() + 1);
  CBoundaryObjectKvs& boundary = list.at(below.empty() ? list.GetCount() : below.front());
  boundary.first = first;
  boundary.last = last;
  return {.page = PageId::boundary,
          .name = below.empty() ? "New boundary" : fmt::format("Boundary {}, both ends", below.front())};
}

MapEdit SetupMap::addOnGrid(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points) {
  if (points.empty()) return refusedEdit("There are no points");
  const NewShape made = newShape(kind, points, isOutput(kind));
  const GridShape& shape = made.shape;
  if (kind == MapKind::source) {
    CSourceSinkKvs& list = *root.sourceSink;
    if (!made.fault.empty()) return refusedEdit(made.fault);
    if (list.GetCount() >= CSourceSinkKvs::kMostSources)
      return refusedEdit(fmt::format("There are no more than {} sources", CSourceSinkKvs::kMostSources));
    list.SetNoSources(list.GetCount() + 1);
    CSourceSinkObjectKvs& source = list.at(list.GetCount());
    const std::size_t second = points.size() > 1 ? 1 : 0;
    source.type = second == 1 ? CSourceSinkObjectKvs::kPair : CSourceSinkObjectKvs::kIsolatedSource;
    source.source = shape.points[0];
    source.sourceArea = shape.areas[0];
    source.sink = shape.points[second];
    source.sinkArea = shape.areas[second];
    return {.page = PageId::sourceAndSink, .name = "New source"};
  }
  if (kind == MapKind::massBudget) {
    CMassBudgetKvs& list = *root.massBudget;
    if (!root.moduleSelection->HasMassBudget())
      return refusedEdit("Mass budgets need a transport module with a scheme that keeps them");
    if (points.size() < shapeRule(kind).least) return refusedEdit("A polygon has three corners at least");
    if (list.GetCount() >= CMassBudgetKvs::kMostOnPage)
      return refusedEdit(fmt::format("There are no more than {} polygons", CMassBudgetKvs::kMostOnPage));
    if (!made.fault.empty()) return refusedEdit(made.fault);
    list.SetNoPolygons(list.GetCount() + 1);
    CMassBudgetItemKvs& polygon = list.at(list.GetCount());
    polygon.associatedArea = shape.area();
    polygon.corners = shape.points;
    return {.page = PageId::massBudget, .name = "New polygon"};
  }
  if (isOutput(kind)) {
    CNhdResultKvs& results = *root.nhdResult;
    const std::size_t least = kind == MapKind::outputPoints ? 1 : 2;
    if (points.size() < least) return refusedEdit(fmt::format("{} points are needed", least));
    if (shape.points.empty()) return refusedEdit(made.fault);
    if (results.outputs.GetCount() >= CNhdResultKvs::kMostOutputs)
      return refusedEdit(fmt::format("There are no more than {} outputs", CNhdResultKvs::kMostOutputs));
    if (!made.fault.empty()) return refusedEdit(made.fault);
    results.outputs.SetCount(results.outputs.GetCount() + 1);
    const int number = results.outputs.GetCount();
    CNhdResultObjectKvs& output = results.outputs.at(number);
    output.TakeWhole();
    if (kind == MapKind::outputPoints) {
      output.type = CNhdResultObjectKvs::kPoints;
    } else {
      output.type = kind == MapKind::outputMap ? CNhdResultObjectKvs::kMap : CNhdResultObjectKvs::kLine;
    }
    giveShape(root, idOf(kind, number, PageId::hdResult), shape);
    return {.page = PageId::hdResult, .name = "New output"};
  }
  return refusedEdit(fmt::format("A {} can't be drawn on the map", kindName(kind)));
}

std::int32_t SetupMap::finestHolding(const std::vector<MapPoint>& points) const {
  std::int32_t number = 0;
  for (const MapArea& area : scene_.areas) {
    const bool holds =
        std::ranges::all_of(points, [&](MapPoint point) { return pointAt(area, point).has_value(); });
    if (holds && (number == 0 || area.level >= scene_.area(number)->level)) number = area.number;
  }
  return number;
}

MapEdit SetupMap::addModuleOutput(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points) {
  const ModuleOutputs outputs = moduleOutputs(root);
  if (outputs.page == PageId::none) return refusedEdit("No module with outputs of its own is chosen");
  if (points.size() < (kind == MapKind::outputPoints ? 1U : 2U)) return refusedEdit("2 points are needed");
  if (outputs.count >= outputs.most)
    return refusedEdit(fmt::format("There are no more than {} outputs", outputs.most));
  const NewShape made = newShape(kind, points, false);
  if (!made.fault.empty()) return refusedEdit(made.fault);
  outputs.setCount(outputs.count + 1);
  outputs.item(outputs.count + 1)->areaNumber = made.shape.area();
  giveShape(root, idOf(kind, outputs.count + 1, outputs.page), made.shape);
  return {.page = outputs.page, .name = "New output"};
}

MapEdit SetupMap::addLineOrBox(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points) {
  const bool isLine = kind == MapKind::discharge;
  LineOrBoxList* list = lineOrBoxList(root, isLine ? scene_.moduleLines : scene_.moduleBoxes);
  if (list == nullptr)
    return refusedEdit(
        fmt::format("The module that is chosen has no {}", isLine ? "discharge lines" : "boxes"));
  if (points.size() < 2) return refusedEdit("2 points are needed");
  if (list->GetCount() >= LineOrBoxList::kMost)
    return refusedEdit(fmt::format("There are no more than {} of them", LineOrBoxList::kMost));
  const NewShape made = newShape(kind, points, false);
  if (!made.fault.empty()) return refusedEdit(made.fault);
  list->SetCount(list->GetCount() + 1);
  list->GetLineOrBox(list->GetCount())->areaNumber = made.shape.area();
  giveShape(root, idOf(kind, list->GetCount(), list->kind().page), made.shape);
  return {.page = list->kind().page, .name = isLine ? "New discharge line" : "New box"};
}

MapEdit SetupMap::removeFeature(CGlobalKvs& root, MapFeatureId feature) {
  const int number = feature.number;
  const auto gone = [&](PageId page) {
    return MapEdit{.page = page, .name = fmt::format("{} {} removed", kindName(feature.kind), number)};
  };
  // What else is said of these stands under their numbers, so that the last one alone can go.
  const auto removeLast = [&](int count, PageId page, const std::function<void()>& remove) {
    if (number != count) return refusedEdit(fmt::format("Only the last one, {}, can be removed", count));
    remove();
    return gone(page);
  };
  if (isStructure(feature.kind)) {
    if (number < 1 || number > structureCount(root, feature.kind))
      return refusedEdit(fmt::format("There is no {} {}", kindName(feature.kind), number));
    removeStructure(root, feature.kind, number);
    return gone(pageOfStructure(feature.kind));
  }
  if (!shapeOf(root, feature))
    return refusedEdit(fmt::format("There is no {} {}", kindName(feature.kind), number));
  switch (feature.kind) {
    case MapKind::boundary:
      if (!root.boundary->isUserSpecified()) return refusedEdit("The boundaries are found by the program");
      return removeLast(root.boundary->GetCount(), PageId::boundary,
                        [&] { root.boundary->SetNoBoundaries(number - 1); });
    case MapKind::source:
      return removeLast(root.sourceSink->GetCount(), PageId::sourceAndSink,
                        [&] { root.sourceSink->SetNoSources(number - 1); });
    case MapKind::massBudget:
      return removeLast(root.massBudget->GetCount(), PageId::massBudget,
                        [&] { root.massBudget->SetNoPolygons(number - 1); });
    default:
      break;
  }
  if (feature.page == static_cast<std::int32_t>(PageId::hdResult))
    return removeLast(root.nhdResult->outputs.GetCount(), PageId::hdResult,
                      [&] { root.nhdResult->outputs.SetCount(number - 1); });
  if (LineOrBoxList* list = lineOrBoxList(root, feature.page))
    return removeLast(list->GetCount(), list->kind().page, [&] { list->SetCount(number - 1); });
  const ModuleOutputs outputs = moduleOutputs(root);
  return removeLast(outputs.count, outputs.page, [&] { outputs.setCount(number - 1); });
}

}  // namespace gridbay
