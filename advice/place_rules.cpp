// Doubts about what is placed in the areas: boundaries, sources, structures.

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>

#include "advice/rules.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/boundary_overlap.h"
#include "basic/nesting.h"
#include "basic/source_sink.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

std::string valueOf(GridPoint point) {
  return fmt::format("{},{}", point.j, point.k);
}

// The points of a straight run, whose ends lie on a grid; none for a diagonal.
std::vector<GridPoint> pointsOf(GridPoint first, GridPoint last) {
  std::vector<GridPoint> points;
  if (first.j != last.j && first.k != last.k) return points;
  const GridPoint step{first.j < last.j   ? 1
                       : first.j > last.j ? -1
                                          : 0,
                       first.k < last.k   ? 1
                       : first.k > last.k ? -1
                                          : 0};
  for (GridPoint at = first;; at = {at.j + step.j, at.k + step.k}) {
    points.push_back(at);
    if (at == last) return points;
  }
}

std::string boundaryKeyword(int number, std::string_view keyword) {
  return fmt::format("NESTED_MODEL_GLOBALS/OPEN_BOUNDARY/BOUNDARY_{}/{}", number, keyword);
}

// A boundary from one point to another one.
AdviceFix movedBoundary(const CBoundaryObjectKvs& boundary, int number, GridPoint first, GridPoint last) {
  AdviceFix fix{fmt::format("Boundary {} from {} to {}", number, pointText(first), pointText(last)), {}};
  if (first != boundary.first)
    fix.settings.push_back({boundaryKeyword(number, "First_Point"), valueOf(first)});
  if (last != boundary.last) fix.settings.push_back({boundaryKeyword(number, "Last_Point"), valueOf(last)});
  return fix;
}

Advice ofBoundary(AdviceContext& context, int number, std::string doubt, std::string reason) {
  const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(number);
  return {{},
          std::move(doubt),
          std::move(reason),
          placeOfEntry(PageId::boundary, "boundary", {number, context.model.boundary->GetCount()},
                       boundaryKeyword(number, "First_Point"), "First point"),
          {.area = 1, .points = {boundary.first, boundary.last}}};
}

bool isWholeOnBorder(const GridFacts& grid, const CBoundaryObjectKvs& boundary) {
  const auto [first, last] = std::pair(boundary.first, boundary.last);
  const bool alongJ = first.k == last.k && (first.k == 0 || first.k == grid.noK - 1);
  const bool alongK = first.j == last.j && (first.j == 0 || first.j == grid.noJ - 1);
  return alongJ || alongK;
}

// What is wrong with a boundary by itself; false when nothing is.
bool adviseBoundary(AdviceContext& context, const GridFacts& grid, int number) {
  const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(number);
  const auto add = [&](std::string doubt, std::string reason, std::optional<AdviceFix> fix = {}) {
    Advice advice = ofBoundary(context, number, std::move(doubt), std::move(reason));
    advice.fix = std::move(fix);
    context.add(std::move(advice));
    return true;
  };
  const auto within = [&](GridPoint point) {
    return GridPoint{std::clamp(point.j, 0, grid.noJ - 1), std::clamp(point.k, 0, grid.noK - 1)};
  };
  const GridPoint first = within(boundary.first);
  const GridPoint last = within(boundary.last);
  if (first != boundary.first || last != boundary.last) {
    const bool isLine = first.j == last.j || first.k == last.k;
    return add(
        fmt::format("Boundary {} from {} to {} goes beyond area 1, whose last point is ({},{}).", number,
                    pointText(boundary.first), pointText(boundary.last), grid.noJ - 1, grid.noK - 1),
        "There is nothing there that it could drive.",
        isLine && first != last ? std::optional(movedBoundary(boundary, number, first, last)) : std::nullopt);
  }
  if (first == last) {
    return add(fmt::format("Boundary {} is a single point, {}.", number, pointText(first)),
               "No water passes through a boundary without a width.");
  }
  if (first.j != last.j && first.k != last.k) return true;  // a fault
  if (!isWholeOnBorder(grid, boundary)) {
    return add(fmt::format("Boundary {} from {} to {} does not lie on the border of area 1.", number,
                           pointText(first), pointText(last)),
               "Behind it water goes on as if it were not there.");
  }
  if (grid.landValue < 0) return false;
  const std::vector<GridPoint> points = pointsOf(first, last);
  const auto isWater = [&grid](GridPoint point) { return grid.isWaterAtBorder(point.j, point.k); };
  const auto wet = std::ranges::find_if(points, isWater);
  if (wet == points.end()) {
    return add(fmt::format("Boundary {} from {} to {} lies wholly on land.", number, pointText(first),
                           pointText(last)),
               "No water comes in or goes out there.");
  }
  const auto lastWet = std::find_if(points.rbegin(), points.rend(), isWater);
  if (*wet == first && *lastWet == last) return false;
  const bool isLine = *wet != *lastWet;
  const auto dry = points.size() - static_cast<std::size_t>(std::ranges::count_if(points, isWater));
  return add(fmt::format("Boundary {} from {} to {} ends on land: {} of its {} points are land.", number,
                         pointText(first), pointText(last), dry, points.size()),
             "A flux is spread over points through which none can go, and values along the boundary shift.",
             isLine ? std::optional(movedBoundary(boundary, number, *wet, *lastWet)) : std::nullopt);
}

void adviseOverlap(AdviceContext& context, int number, int other) {
  const CBoundaryObjectKvs& a = *context.model.boundary->GetItem(other);
  const CBoundaryObjectKvs& b = *context.model.boundary->GetItem(number);
  if (a.first == a.last || b.first == b.last) return;
  const std::optional<BoundarySpan> common = commonOf(a, b);
  if (!common) return;
  Advice advice = ofBoundary(context, number,
                             fmt::format("Boundaries {} and {} have {} points in common.", other, number,
                                         common->high - common->low + 1),
                             "Two conditions hold at one point, and the engine takes one of them.");
  // The later one begins or ends beside the other.
  const bool alongJ = b.first.k == b.last.k;
  GridPoint low = b.first;
  GridPoint high = b.last;
  const bool isTurned = alongJ ? low.j > high.j : low.k > high.k;
  if (isTurned) std::swap(low, high);
  int& lowAt = alongJ ? low.j : low.k;
  int& highAt = alongJ ? high.j : high.k;
  if (common->low > lowAt) {
    highAt = common->low - 1;
  } else {
    lowAt = common->high + 1;
  }
  if (lowAt < highAt) {
    if (isTurned) std::swap(low, high);
    advice.fix = movedBoundary(b, number, low, high);
  }
  context.add(std::move(advice));
}

// Whether an area embedded in area `number` covers the point, by the grids on file.
bool isCovered(AdviceContext& context, int number, GridPoint point) {
  for (int inner = 2; inner <= context.model.bathymetry->GetCount(); ++inner) {
    const CBathymetryObjectKvs& area = *context.model.bathymetry->GetArea(inner);
    const GridFacts* grid = context.grid(inner);
    if (area.enclosingArea != number || grid == nullptr) continue;
    const std::int64_t j = std::int64_t{point.j} - area.origin.j;
    const std::int64_t k = std::int64_t{point.k} - area.origin.k;
    if (j >= 0 && k >= 0 && j <= grid->noJ / kNestingRatio && k <= grid->noK / kNestingRatio) return true;
  }
  return false;
}

void adviseSourcePoint(AdviceContext& context, int number, bool isSource) {
  const CSourceSinkObjectKvs& location = *context.model.sourceSink->GetItem(number);
  const GridPoint point = isSource ? location.source : location.sink;
  const int area = isSource ? location.sourceArea : location.sinkArea;
  const GridFacts* grid = context.grid(area);
  if (grid == nullptr || !grid->contains(point.j, point.k)) return;
  const char* what = isSource ? "Source" : "Sink";
  int inBoundary = 0;
  for (int each = 1; area == 1 && each <= context.model.boundary->GetCount() && inBoundary == 0; ++each) {
    const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(each);
    const auto [lowJ, highJ] = std::minmax(boundary.first.j, boundary.last.j);
    const auto [lowK, highK] = std::minmax(boundary.first.k, boundary.last.k);
    if (lowJ <= point.j && point.j <= highJ && lowK <= point.k && point.k <= highK) inBoundary = each;
  }
  if (inBoundary == 0 && !grid->isOnBorder(point.j, point.k)) return;
  Advice advice{
      {},
      inBoundary != 0
          ? fmt::format("{} {} at {} lies in boundary {}.", what, number, pointText(point), inBoundary)
          : fmt::format("{} {} at {} lies on the edge of area {}.", what, number, pointText(point), area),
      inBoundary != 0 ? "The boundary gives the level or flux there, and what the source brings is lost."
                      : "The edge is not calculated: what enters there is lost.",
      placeOfEntry(PageId::sourceAndSink, isSource ? "source" : "sink",
                   {number, context.model.sourceSink->GetCount()},
                   fmt::format("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_{}/{}", number,
                               isSource ? "Source_Point" : "Sink_Point"),
                   what),
      {.area = area, .points = {point}}};
  const GridPoint inside{std::clamp(point.j, 1, grid->noJ - 2), std::clamp(point.k, 1, grid->noK - 2)};
  const bool isFree = grid->noJ > 2 && grid->noK > 2 && inside != point &&
                      grid->isWater(inside.j, inside.k) == true && !isCovered(context, area, inside);
  if (isFree)
    advice.fix =
        AdviceFix{fmt::format("Move {} {} to {}", isSource ? "source" : "sink", number, pointText(inside)),
                  {{advice.place.keyword, valueOf(inside)}}};
  context.add(std::move(advice));
}

// A line in a projection.
struct Line {
  PageId page;
  std::string thing;
  std::string path;
  int number;
  int count;
  const std::string& projection;
  std::vector<AdviceSite::MapPoint> points;
};

// Lists of numbers as a keyword takes them.
std::string listed(const std::vector<AdviceSite::MapPoint>& points, double AdviceSite::MapPoint::*of) {
  std::string text;
  for (const AdviceSite::MapPoint& point : points)
    text += fmt::format("{}{}", text.empty() ? "" : ",", point.*of);
  return text;
}

// The settings by which a structure or dike loses the point `at`, from 0; nothing for very long lines.
std::optional<AdviceFix> withoutPoint(AdviceContext& context, const Line& line, std::size_t at) {
  constexpr std::size_t kMost = 1000;
  if (line.points.size() > kMost || line.points.size() < 3) return std::nullopt;
  std::vector<AdviceSite::MapPoint> rest = line.points;
  rest.erase(rest.begin() + static_cast<std::ptrdiff_t>(at));
  AdviceFix fix{fmt::format("Point {} of {} out", at + 1, line.thing), {}};
  if (line.page == PageId::dikes) {
    const CNhdDikeObjectKvs& dike = *context.model.nhdDike->GetItem(line.number);
    for (std::size_t i = at; i < rest.size(); ++i) {
      const DikePoint& next = std::as_const(dike.points)[i + 1];
      for (const auto& [name, value] : {std::pair{"x", next.x}, {"y", next.y}, {"z", next.z}})
        fix.settings.push_back(
            {fmt::format("{}/POINT_{}/{}", line.path, i + 1, name), fmt::format("{}", value)});
    }
    fix.settings.push_back({line.path + "/number_of_points", std::to_string(rest.size())});
  } else {
    fix.settings = {{line.path + "/number_of_points", std::to_string(rest.size())},
                    {line.path + "/x", listed(rest, &AdviceSite::MapPoint::easting)},
                    {line.path + "/y", listed(rest, &AdviceSite::MapPoint::northing)}};
  }
  return fix;
}

void adviseLine(AdviceContext& context, const Line& line) {
  const auto add = [&](std::string doubt, std::string reason, std::optional<AdviceFix> fix = {}) {
    context.add({{},
                 std::move(doubt),
                 std::move(reason),
                 {.page = line.page,
                  .thing = line.thing,
                  .keyword = line.path + "/number_of_points",
                  .entries = {{line.number, line.count}}},
                 {.projection = line.projection, .mapPoints = line.points},
                 std::move(fix)});
  };
  const std::string subject = static_cast<char>(std::toupper(line.thing[0])) + line.thing.substr(1);
  if (line.points.size() < 2) {
    return add(
        fmt::format("{} has {} point{}.", subject, line.points.size(), line.points.size() == 1 ? "" : "s"),
        "A line without two ends lies nowhere.");
  }
  const auto equal = std::ranges::adjacent_find(line.points);
  if (equal != line.points.end()) {
    const auto at = static_cast<std::size_t>(equal - line.points.begin());
    add(fmt::format("Points {} and {} of {} are equal.", at + 1, at + 2, line.thing),
        "A piece of no length has no direction for the flow across it.", withoutPoint(context, line, at + 1));
  }
  const GridFacts* grid = context.grid(1);
  if (grid == nullptr) return;
  // Of a very long line some of its points tell.
  constexpr std::size_t kMost = 1000;
  std::vector<AdviceSite::MapPoint> some;
  for (std::size_t i = 0; i < line.points.size(); i += line.points.size() / kMost + 1)
    some.push_back(line.points[i]);
  some.push_back(line.points.back());
  std::optional<std::vector<GridSpot>> spots = context.spotsOn(1, line.projection, some);
  if (!spots && CVdMapProjection::IsLocal(line.projection) && !grid->file.geography) {
    spots.emplace();
    for (const auto& [easting, northing] : some)
      spots->push_back({(easting - grid->file.axes[0].first) / grid->dx,
                        (northing - grid->file.axes[1].first) / grid->dy});
  }
  // All on one side is outside for certain; a line may also pass through with no point inside.
  const auto beyond = [&](auto isBeyond) { return std::ranges::all_of(*spots, isBeyond); };
  const double half = 0.5;
  const bool isOutside = spots && (beyond([&](GridSpot at) { return at.j < -half; }) ||
                                   beyond([&](GridSpot at) { return at.k < -half; }) ||
                                   beyond([&](GridSpot at) { return at.j > grid->noJ - half; }) ||
                                   beyond([&](GridSpot at) { return at.k > grid->noK - half; }));
  if (isOutside)
    add(fmt::format("{} lies outside of all areas.", subject),
        "It has no effect, unless its coordinates or its projection are wrong.");
}

void adviseLineStructures(AdviceContext& context, PageId page, auto& list, std::string_view what,
                          std::string_view path) {
  for (int number = 1; number <= list.GetCount(); ++number) {
    const LineStructure& structure = *list.GetItem(number);
    Line line{page,   thingOf(what, number), fmt::format(fmt::runtime(path), number),
              number, list.GetCount(),       structure.coordinateType,
              {}};
    for (std::size_t i = 0; i < std::min(structure.x.size(), structure.y.size()); ++i)
      line.points.push_back({structure.x[i], structure.y[i]});
    adviseLine(context, line);
  }
}

}  // namespace

void adviseBoundaries(AdviceContext& context) {
  const GridFacts* grid = context.grid(1);
  for (int number = 1; number <= context.model.boundary->GetCount(); ++number) {
    if (grid != nullptr && adviseBoundary(context, *grid, number)) continue;
    for (int other = 1; other < number; ++other) adviseOverlap(context, number, other);
  }
}

void adviseSources(AdviceContext& context) {
  for (int number = 1; number <= context.model.sourceSink->GetCount(); ++number) {
    const std::int32_t type = context.model.sourceSink->GetItem(number)->type;
    if (type != CSourceSinkObjectKvs::kIsolatedSink) adviseSourcePoint(context, number, true);
    if (type != CSourceSinkObjectKvs::kIsolatedSource) adviseSourcePoint(context, number, false);
  }
}

void adviseStructures(AdviceContext& context) {
  constexpr std::string_view kStructures = "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE";
  adviseLineStructures(context, PageId::weirs, *context.model.nhdWeir, "weir",
                       fmt::format("{}/WEIR/weir_data[{{}}]", kStructures));
  adviseLineStructures(context, PageId::culverts, *context.model.nhdCulvert, "culvert",
                       fmt::format("{}/CULVERTS/Culvert_data[{{}}]", kStructures));
  CNhdDikeKvs& dikes = *context.model.nhdDike;
  for (int number = 1; number <= dikes.GetCount(); ++number) {
    const CNhdDikeObjectKvs& dike = *dikes.GetItem(number);
    if (dike.include == 0) continue;
    Line line{PageId::dikes,
              thingOf("dike", number),
              fmt::format("HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_{}", number),
              number,
              dikes.GetCount(),
              dike.coordinateType,
              {}};
    line.points.reserve(dike.points.size());
    for (std::size_t i = 0; i < dike.points.size(); ++i) {
      const DikePoint& point = std::as_const(dike.points)[i];
      line.points.push_back({point.x, point.y});
    }
    adviseLine(context, line);
  }
}

}  // namespace gridbay
