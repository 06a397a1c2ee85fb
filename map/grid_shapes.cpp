#include "map/grid_shapes.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "map/module_outputs.h"

namespace gridbay {
namespace {

using HdOutput = CNhdResultObjectKvs;

HdOutput* flowOutput(CGlobalKvs& root, MapFeatureId id) {
  return id.page == static_cast<std::int32_t>(PageId::hdResult) ? root.nhdResult->outputs.GetItem(id.number)
                                                                : nullptr;
}

MapKind kindOf(Extent extent) {
  if (extent == Extent::map) return MapKind::outputMap;
  return extent == Extent::line ? MapKind::outputLine : MapKind::outputPoints;
}

MapKind kindOf(const HdOutput& output) {
  return output.type == HdOutput::kPoints ? MapKind::outputPoints : kindOf(extentOf(output.part));
}

MapDrive driveOf(const CNhdBoundaryObjectKvs* boundary) {
  using Boundary = CNhdBoundaryObjectKvs;
  if (boundary == nullptr) return MapDrive::none;
  const bool isLevel = boundary->formulation == Boundary::kLevel;
  switch (boundary->dataFormat) {
    case Boundary::kConstant:
      return isLevel ? MapDrive::levelConstant : MapDrive::fluxConstant;
    case Boundary::kSineSeries:
      return isLevel ? MapDrive::levelSeries : MapDrive::fluxSeries;
    case Boundary::kRatingCurve:
      return MapDrive::ratingCurve;
    default:
      return isLevel ? MapDrive::levelFile : MapDrive::fluxFile;
  }
}

MapDrive driveOf(const CSourceSinkObjectKvs& source) {
  if (source.type == CSourceSinkObjectKvs::kPair) return MapDrive::pair;
  return source.type == CSourceSinkObjectKvs::kIsolatedSink ? MapDrive::sink : MapDrive::source;
}

GridShape onArea(std::int32_t area, std::vector<GridPoint> points, bool closed = false, bool joined = true) {
  std::vector<std::int32_t> areas(points.size(), area);
  return {std::move(points), std::move(areas), closed, joined};
}

GridShape shapeOfPart(std::int32_t area, const USubArea& part) {
  const GridPoint first{part.x.first, part.y.first};
  const GridPoint last{part.x.last, part.y.last};
  switch (extentOf(part)) {
    case Extent::map:
      return onArea(area, rectangleOf(first, last), true);
    case Extent::line:
      return onArea(area, {first, last});
    default:
      return onArea(area, {first}, false, false);
  }
}

void givePart(USubArea& part, const std::vector<GridPoint>& points) {
  const auto range = [&points](std::int32_t GridPoint::*along, USubLine& line) {
    const auto [least, most] = std::ranges::minmax(points, {}, along);
    line.first = least.*along;
    line.last = most.*along;
  };
  range(&GridPoint::j, part.x);
  range(&GridPoint::k, part.y);
}

std::int32_t whole(double number) {
  constexpr double kMost = 2147483647.0;
  return std::abs(number) < kMost ? static_cast<std::int32_t>(std::lround(number)) : -1;
}

// Points before and after those that differ stay as they are, whole or not.
void givePoints(HdOutput& output, const std::vector<GridPoint>& points) {
  const auto count = static_cast<std::size_t>(output.PointCount());
  const auto isSame = [&](std::size_t old, std::size_t now) {
    return GridPoint{whole(output.pointsJ[old]), whole(output.pointsK[old])} == points[now];
  };
  const std::size_t both = std::min(count, points.size());
  std::size_t before = 0;
  while (before < both && isSame(before, before)) ++before;
  std::size_t after = 0;
  while (before + after < both && isSame(count - 1 - after, points.size() - 1 - after)) ++after;
  std::vector<double> j(points.size());
  std::vector<double> k(points.size());
  for (std::size_t i = 0; i < points.size(); ++i) {
    const bool isKept = i < before || i >= points.size() - after;
    const std::size_t old = i < before ? i : i + count - points.size();
    j[i] = isKept ? output.pointsJ[old] : points[i].j;
    k[i] = isKept ? output.pointsK[old] : points[i].k;
  }
  output.pointsJ = std::move(j);
  output.pointsK = std::move(k);
}

std::string titleOr(const std::string& title, std::string_view what, int number) {
  return title.empty() ? fmt::format("{} {}", what, number) : title;
}

}  // namespace

std::vector<GridPoint> rectangleOf(GridPoint a, GridPoint b) {
  const auto [left, right] = std::minmax(a.j, b.j);
  const auto [low, high] = std::minmax(a.k, b.k);
  return {{left, low}, {right, low}, {right, high}, {left, high}};
}

std::vector<ListedShape> listedShapes(CGlobalKvs& root) {
  std::vector<ListedShape> list;
  const auto add = [&list](MapKind kind, int number, PageId page, std::string label,
                           MapDrive drive = MapDrive::none) -> ListedShape& {
    list.push_back({{kind, number, static_cast<std::int32_t>(page)}, std::move(label), drive, number, 0});
    return list.back();
  };
  for (int number = 1; number <= root.boundary->GetCount(); ++number)
    add(MapKind::boundary, number, PageId::boundary, std::to_string(number),
        driveOf(root.nhdBoundary->GetItem(number)));
  for (int number = 1; number <= root.sourceSink->GetCount(); ++number)
    add(MapKind::source, number, PageId::sourceAndSink, std::to_string(number),
        driveOf(*root.sourceSink->GetItem(number)));
  for (int number = 1; root.moduleSelection->HasMassBudget() && number <= root.massBudget->GetCount();
       ++number) {
    ListedShape& polygon =
        add(MapKind::massBudget, number, PageId::massBudget, fmt::format("Polygon {}", number));
    polygon.row = 0;
    polygon.column = number;
  }
  for (int number = 1; number <= root.nhdResult->outputs.GetCount(); ++number) {
    const HdOutput& output = root.nhdResult->outputs.at(number);
    add(kindOf(output), number, PageId::hdResult, titleOr(output.title, "Output", number));
  }
  const ModuleOutputs outputs = moduleOutputs(root);
  for (int number = 1; number <= outputs.count; ++number) {
    const TransportOutput& output = *outputs.item(number);
    add(kindOf(extentOf(output.part)), number, outputs.page, titleOr(output.title, "Output", number));
  }
  for (LineOrBoxList* lines : linesAndBoxes(root)) {
    const bool isLine = lines->kind().isLine;
    for (int number = 1; number <= lines->GetCount(); ++number)
      add(isLine ? MapKind::discharge : MapKind::box, number, lines->kind().page,
          titleOr(lines->GetLineOrBox(number)->title, isLine ? "Line" : "Box", number));
  }
  return list;
}

std::optional<GridShape> shapeOf(CGlobalKvs& root, MapFeatureId id) {
  switch (id.kind) {
    case MapKind::boundary:
      if (const CBoundaryObjectKvs* boundary = root.boundary->GetItem(id.number))
        return onArea(1, {boundary->first, boundary->last});
      return std::nullopt;
    case MapKind::source: {
      using Source = CSourceSinkObjectKvs;
      const Source* source = root.sourceSink->GetItem(id.number);
      if (source == nullptr) return std::nullopt;
      if (source->type == Source::kIsolatedSource) return onArea(source->sourceArea, {source->source});
      if (source->type == Source::kIsolatedSink) return onArea(source->sinkArea, {source->sink});
      return GridShape{{source->source, source->sink}, {source->sourceArea, source->sinkArea}};
    }
    case MapKind::massBudget:
      if (const CMassBudgetItemKvs* polygon = root.massBudget->GetItem(id.number))
        return onArea(polygon->associatedArea, polygon->corners, true);
      return std::nullopt;
    case MapKind::outputMap:
    case MapKind::outputLine:
    case MapKind::outputPoints:
      if (const HdOutput* output = flowOutput(root, id)) {
        if (output->type != HdOutput::kPoints) return shapeOfPart(HdOutput::kAreaNumber, output->part);
        std::vector<GridPoint> points;
        for (std::size_t i = 0; i < static_cast<std::size_t>(output->PointCount()); ++i)
          points.push_back({whole(output->pointsJ[i]), whole(output->pointsK[i])});
        return onArea(HdOutput::kAreaNumber, std::move(points), false, false);
      }
      if (const TransportOutput* output = moduleOutput(root, id))
        return shapeOfPart(output->areaNumber, output->part);
      return std::nullopt;
    case MapKind::discharge:
    case MapKind::box:
      if (const LineOrBox* item = lineOrBox(root, id)) {
        if (id.kind == MapKind::discharge) return onArea(item->areaNumber, {item->first, item->last});
        return onArea(item->areaNumber, rectangleOf(item->first, item->last), true);
      }
      return std::nullopt;
    default:
      return std::nullopt;
  }
}

void giveShape(CGlobalKvs& root, MapFeatureId id, const GridShape& shape) {
  const std::vector<GridPoint>& points = shape.points;
  switch (id.kind) {
    case MapKind::boundary:
      root.boundary->at(id.number).first = points.at(0);
      root.boundary->at(id.number).last = points.at(1);
      break;
    case MapKind::source: {
      CSourceSinkObjectKvs& source = root.sourceSink->at(id.number);
      const bool isSink = source.type == CSourceSinkObjectKvs::kIsolatedSink;
      const auto give = [&](std::size_t at, GridPoint& point, std::int32_t& area) {
        point = points.at(at);
        area = shape.areas.at(at);
      };
      if (!isSink) give(0, source.source, source.sourceArea);
      if (isSink || points.size() > 1) give(isSink ? 0 : 1, source.sink, source.sinkArea);
      break;
    }
    case MapKind::massBudget:
      root.massBudget->at(id.number).corners = points;
      root.massBudget->at(id.number).associatedArea = shape.area();
      break;
    case MapKind::outputMap:
    case MapKind::outputLine:
    case MapKind::outputPoints:
      if (HdOutput* output = flowOutput(root, id); output != nullptr && output->type == HdOutput::kPoints) {
        givePoints(*output, points);
      } else if (output != nullptr) {
        givePart(output->part, points);
      } else if (TransportOutput* other = moduleOutput(root, id)) {
        givePart(other->part, points);
      }
      break;
    case MapKind::discharge:
      if (LineOrBox* line = lineOrBox(root, id)) {
        // From the lower J to the higher one, as the check of it asks.
        const bool isTurned = points.at(0).j > points.at(1).j;
        line->first = points[isTurned ? 1 : 0];
        line->last = points[isTurned ? 0 : 1];
      }
      break;
    case MapKind::box:
      if (LineOrBox* box = lineOrBox(root, id)) {
        box->first = points.at(0);
        box->last = points.at(2);
      }
      break;
    default:
      break;
  }
}

ShapeRule shapeRule(MapKind kind) {
  constexpr std::size_t kLeastCorners = 3;
  switch (kind) {
    case MapKind::massBudget:
      return {true, kLeastCorners};
    case MapKind::outputPoints:
      return {true, 1};
    case MapKind::dike:
    case MapKind::weir:
    case MapKind::culvert:
      return {true, 2};
    default:
      return {};
  }
}

}  // namespace gridbay
