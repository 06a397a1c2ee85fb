// What is drawn on the map, and removed there.

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>

#include "basic/boundary.h"
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

// Two points as the ends of what an output of a kind covers: a line follows the axis along which it is
// longer. What is wrong, or empty.
std::string makeExtent(MapKind kind, GridPoint first, GridPoint& last) {
  if ((kind == MapKind::outputMap || kind == MapKind::box) && (first.j == last.j || first.k == last.k))
    return "The rectangle is narrower than the grid's cells";
  if (kind == MapKind::outputLine) {
    const bool alongJ = std::abs(first.j - last.j) >= std::abs(first.k - last.k);
    (alongJ ? last.k : last.j) = alongJ ? first.k : first.j;
  }
  if ((kind == MapKind::outputLine || kind == MapKind::discharge) && first == last)
    return "The line is shorter than the grid's cells";
  return {};
}

}  // namespace

MapEdit SetupMap::addFeature(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points,
                             std::int32_t page) {
  scene(root);
  if (kind == MapKind::discharge || kind == MapKind::box) return addLineOrBox(root, kind, points);
  const bool isOfFlow = page == 0 || page == static_cast<std::int32_t>(PageId::hdResult);
  if (isOutput(kind) && !isOfFlow) return addModuleOutput(root, kind, points);
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

MapEdit SetupMap::addOnGrid(CGlobalKvs& root, MapKind kind, const std::vector<MapPoint>& points) {
  if (points.empty()) return refusedEdit("There are no points");
  const auto outer = pick(points.front(), 1);
  // What the outermost area alone has.
  const auto onOuter = [&](std::size_t least) {
    if (points.size() < least) return fmt::format("{} points are needed", least);
    const bool isInside =
        std::ranges::all_of(points, [this](MapPoint point) { return pick(point, 1).has_value(); });
    return isInside ? std::string() : std::string("Area 1 does not reach there");
  };
  if (kind == MapKind::boundary) {
    CBoundaryKvs& list = *root.boundary;
    const MapArea* area = scene_.area(1);
    if (!list.isUserSpecified())
      return refusedEdit(
          "The boundaries are found by the program; choose \"User specified\" on their page first");
    if (area == nullptr || !area->isPlaced) return refusedEdit("Area 1 has no place on the map");
    if (points.size() < 2) return refusedEdit("2 points are needed");
    if (list.GetCount() >= CBoundaryKvs::kMostOnPage)
      return refusedEdit(fmt::format("There are no more than {} boundaries", CBoundaryKvs::kMostOnPage));
    const auto [j, k] = area->grid.pointOf(points[0]);
    const auto [lastJ, lastK] = area->grid.pointOf(points[1]);
    const GridPoint first = slideAlongBorder(j, k, area->nx, area->ny, {});
    const GridPoint last = slideAlongBorder(lastJ, lastK, area->nx, area->ny, first);
    if (last == first) return refusedEdit("The boundary is shorter than the spacing of Area 1");
    list.SetNoBoundaries(list.GetCount() + 1);
    CBoundaryObjectKvs& boundary = list.at(list.GetCount());
    boundary.first = first;
    boundary.last = last;
    return {.page = PageId::boundary, .name = "New boundary"};
  }
  if (kind == MapKind::source) {
    CSourceSinkKvs& list = *root.sourceSink;
    const auto first = pick(points.front(), 0);
    const auto second = points.size() > 1 ? pick(points[1], 0) : first;
    if (!first || !second) return refusedEdit("There is no area");
    if (list.GetCount() >= CSourceSinkKvs::kMostSources)
      return refusedEdit(fmt::format("There are no more than {} sources", CSourceSinkKvs::kMostSources));
    list.SetNoSources(list.GetCount() + 1);
    CSourceSinkObjectKvs& source = list.at(list.GetCount());
    source.type = points.size() > 1 ? CSourceSinkObjectKvs::kPair : CSourceSinkObjectKvs::kIsolatedSource;
    source.source = first->point;
    source.sourceArea = first->area;
    source.sink = second->point;
    source.sinkArea = second->area;
    return {.page = PageId::sourceAndSink, .name = "New source"};
  }
  if (kind == MapKind::massBudget) {
    CMassBudgetKvs& list = *root.massBudget;
    if (!root.moduleSelection->HasMassBudget())
      return refusedEdit("Mass budgets need a transport module with a scheme that keeps them");
    if (points.size() < shapeRule(kind).least) return refusedEdit("A polygon has three corners at least");
    if (list.GetCount() >= CMassBudgetKvs::kMostOnPage)
      return refusedEdit(fmt::format("There are no more than {} polygons", CMassBudgetKvs::kMostOnPage));
    const std::int32_t number = finestHolding(points);
    if (number == 0) return refusedEdit("No area holds the whole polygon");
    list.SetNoPolygons(list.GetCount() + 1);
    CMassBudgetItemKvs& polygon = list.at(list.GetCount());
    polygon.associatedArea = number;
    polygon.corners.clear();
    for (const MapPoint point : points) polygon.corners.push_back(*pointAt(*scene_.area(number), point));
    return {.page = PageId::massBudget, .name = "New polygon"};
  }
  if (isOutput(kind)) {
    CNhdResultKvs& results = *root.nhdResult;
    const std::size_t least = kind == MapKind::outputPoints ? 1 : 2;
    if (const std::string fault = onOuter(least); !fault.empty()) return refusedEdit(fault);
    if (results.outputs.GetCount() >= CNhdResultKvs::kMostOutputs)
      return refusedEdit(fmt::format("There are no more than {} outputs", CNhdResultKvs::kMostOutputs));
    const GridPoint first = outer->point;
    GridPoint last = pick(points.back(), 1)->point;
    if (std::string fault = makeExtent(kind, first, last); !fault.empty()) return refusedEdit(fault);
    results.outputs.SetCount(results.outputs.GetCount() + 1);
    const int number = results.outputs.GetCount();
    CNhdResultObjectKvs& output = results.outputs.at(number);
    output.TakeWhole();
    if (kind == MapKind::outputPoints) {
      output.type = CNhdResultObjectKvs::kPoints;
    } else {
      output.type = kind == MapKind::outputMap ? CNhdResultObjectKvs::kMap : CNhdResultObjectKvs::kLine;
    }
    GridShape shape;
    if (kind == MapKind::outputPoints) {
      for (const MapPoint point : points) shape.points.push_back(pick(point, 1)->point);
    } else {
      shape.points = {first, last};
    }
    shape.areas.assign(shape.points.size(), 1);
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
  const std::int32_t number = finestHolding(points);
  if (number == 0) return refusedEdit("No area holds the whole output");
  const GridPoint first = pick(points.front(), number)->point;
  GridPoint last = kind == MapKind::outputPoints ? first : pick(points.back(), number)->point;
  if (std::string fault = makeExtent(kind, first, last); !fault.empty()) return refusedEdit(fault);
  outputs.setCount(outputs.count + 1);
  outputs.item(outputs.count + 1)->areaNumber = number;
  giveShape(root, idOf(kind, outputs.count + 1, outputs.page), {{first, last}, {number, number}});
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
  const std::int32_t number = finestHolding(points);
  if (number == 0) return refusedEdit(fmt::format("No area holds the whole {}", isLine ? "line" : "box"));
  const GridPoint first = pick(points.front(), number)->point;
  GridPoint last = pick(points.back(), number)->point;
  if (std::string fault = makeExtent(kind, first, last); !fault.empty()) return refusedEdit(fault);
  list->SetCount(list->GetCount() + 1);
  list->GetLineOrBox(list->GetCount())->areaNumber = number;
  const std::vector<GridPoint> corners =
      isLine ? std::vector<GridPoint>{first, last} : rectangleOf(first, last);
  giveShape(root, idOf(kind, list->GetCount(), list->kind().page), {corners, {number, number}});
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
