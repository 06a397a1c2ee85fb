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

std::string capital(std::string_view text) {
  return static_cast<char>(std::toupper(text.front())) + std::string(text.substr(1));
}

std::string boundaryKeyword(int number, std::string_view keyword) {
  return fmt::format("NESTED_MODEL_GLOBALS/OPEN_BOUNDARY/BOUNDARY_{}/{}", number, keyword);
}

// A boundary from one point to another one. One that the program has found is the user's from then on.
AdviceFix movedBoundary(AdviceContext& context, int number, GridPoint first, GridPoint last) {
  const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(number);
  AdviceFix fix{fmt::format("Boundary {} from {} to {}", number, pointText(first), pointText(last)), {}};
  if (!context.model.boundary->isUserSpecified())
    fix.settings.push_back({"NESTED_MODEL_GLOBALS/OPEN_BOUNDARY/Default_Position", "0"});
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

// A straight run of points.
struct Run {
  GridPoint first, last;

  bool isAlongJ() const { return first.k == last.k; }
};

Run runOf(AdviceContext& context, int number) {
  const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(number);
  return {boundary.first, boundary.last};
}

GridPoint withinGrid(const GridFacts& grid, GridPoint point) {
  return {std::clamp(point.j, 0, grid.noJ - 1), std::clamp(point.k, 0, grid.noK - 1)};
}

// A run that lies in the grid, slid to the edge that is nearest to it; the whole edge for a single point.
Run onEdge(const GridFacts& grid, Run run) {
  const int lastJ = grid.noJ - 1;
  const int lastK = grid.noK - 1;
  const GridPoint at = run.first;
  if (run.first == run.last) {
    const bool isNearK = std::min(at.j, lastJ - at.j) <= std::min(at.k, lastK - at.k);
    run = isNearK ? Run{{at.j, 0}, {at.j, lastK}} : Run{{0, at.k}, {lastJ, at.k}};
  }
  if (run.isAlongJ()) {
    run.first.k = run.last.k = run.first.k <= lastK - run.first.k ? 0 : lastK;
  } else {
    run.first.j = run.last.j = run.first.j <= lastJ - run.first.j ? 0 : lastJ;
  }
  return run;
}

// The longest part of a boundary on the border that no other boundary has and that ends in water; of a single
// point the water around it. Nothing where there are no two such points.
std::optional<Run> usablePart(AdviceContext& context, const GridFacts& grid, int number) {
  const Run whole = runOf(context, number);
  const Run inGrid{withinGrid(grid, whole.first), withinGrid(grid, whole.last)};
  const bool isPoint = whole.first == whole.last;
  const bool isLine = inGrid.first != inGrid.last && (inGrid.first.j == inGrid.last.j || inGrid.isAlongJ());
  if (!isPoint && !isLine) return std::nullopt;
  const Run run = onEdge(grid, inGrid);
  std::vector<Run> taken;  // along it by others
  for (int other = 1; other <= context.model.boundary->GetCount(); ++other) {
    const Run each = runOf(context, other);
    if (other != number && each.first != each.last && commonOf(each, run)) taken.push_back(each);
  }
  const auto isTaken = [&](GridPoint point) {
    return std::ranges::any_of(taken, [&](const Run& each) {
      return commonOf(each, Run{point, point}).has_value();
    });
  };
  const auto isWater = [&](GridPoint point) {
    return grid.landValue < 0 || grid.isWaterAtBorder(point.j, point.k);
  };
  std::optional<Run> best;
  std::size_t most = 1;
  const std::vector<GridPoint> points = pointsOf(run.first, run.last);
  for (std::size_t from = 0; from < points.size();) {
    // Of a line land within it is a part; the water around a point ends at land.
    const auto breaks = [&](GridPoint point) { return isTaken(point) || (isPoint && !isWater(point)); };
    std::size_t to = from;
    while (to < points.size() && !breaks(points[to])) ++to;
    const std::size_t next = to + 1;
    while (to > from && !isWater(points[to - 1])) --to;
    while (from < to && !isWater(points[from])) ++from;
    const auto inPart = std::span(points).subspan(from, to - from);
    const bool isOfPoint = !isPoint || std::ranges::any_of(inPart, [&](GridPoint point) {
      return run.isAlongJ() ? point.j == inGrid.first.j : point.k == inGrid.first.k;
    });
    if (isOfPoint && inPart.size() > most) {
      most = inPart.size();
      best = Run{inPart.front(), inPart.back()};
    }
    from = next;
  }
  return best;
}

// The part of a boundary that can drive something; one that has none goes.
AdviceFix usableBoundary(AdviceContext& context, const GridFacts& grid, int number) {
  if (const std::optional<Run> part = usablePart(context, grid, number))
    return movedBoundary(context, number, part->first, part->last);
  AdviceFix fix{fmt::format("Boundary {} out", number)};
  if (!context.model.boundary->isUserSpecified())
    fix.settings.push_back({"NESTED_MODEL_GLOBALS/OPEN_BOUNDARY/Default_Position", "0"});
  fix.removal = AdviceRemoval{AdviceRemoval::List::boundary, number};
  return fix;
}

// What is wrong with a boundary by itself; false when nothing is.
bool adviseBoundary(AdviceContext& context, const GridFacts& grid, int number) {
  const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(number);
  const auto add = [&](std::string doubt, std::string reason) {
    Advice advice = ofBoundary(context, number, std::move(doubt), std::move(reason));
    const bool isDiagonal = boundary.first.j != boundary.last.j && boundary.first.k != boundary.last.k;
    if (!isDiagonal) advice.fix = usableBoundary(context, grid, number);
    advice.todo = "Choose two points on one edge of area 1.";
    context.add(std::move(advice));
    return true;
  };
  const GridPoint first = withinGrid(grid, boundary.first);
  const GridPoint last = withinGrid(grid, boundary.last);
  if (first != boundary.first || last != boundary.last) {
    return add(
        fmt::format("Boundary {} from {} to {} goes beyond area 1, whose last point is ({},{}).", number,
                    pointText(boundary.first), pointText(boundary.last), grid.noJ - 1, grid.noK - 1),
        "There is nothing there that it could drive.");
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
  const auto wet = std::ranges::count_if(points, isWater);
  if (wet == 0) {
    return add(fmt::format("Boundary {} from {} to {} lies wholly on land.", number, pointText(first),
                           pointText(last)),
               "No water comes in or goes out there.");
  }
  if (isWater(first) && isWater(last)) return false;
  return add(fmt::format("Boundary {} from {} to {} ends on land: {} of its {} points are land.", number,
                         pointText(first), pointText(last), points.size() - static_cast<std::size_t>(wet),
                         points.size()),
             "A flux is spread over points through which none can go, and values along the boundary shift.");
}

void adviseOverlap(AdviceContext& context, const GridFacts* grid, int number, int other) {
  const Run a = runOf(context, other);
  const Run b = runOf(context, number);
  if (a.first == a.last || b.first == b.last) return;
  const std::optional<BoundarySpan> common = commonOf(a, b);
  if (!common) return;
  Advice advice = ofBoundary(context, number,
                             fmt::format("Boundaries {} and {} have {} points in common.", other, number,
                                         common->high - common->low + 1),
                             "Two conditions hold at one point, and the engine takes one of them.");
  // The later one begins or ends beside the other.
  if (grid != nullptr) advice.fix = usableBoundary(context, *grid, number);
  advice.todo = "Let one of them begin behind the end of the other one.";
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

// The boundary that a point of area 1 lies in, from 1; 0 for none.
int boundaryAt(AdviceContext& context, GridPoint point) {
  for (int number = 1; number <= context.model.boundary->GetCount(); ++number) {
    const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(number);
    const auto [lowJ, highJ] = std::minmax(boundary.first.j, boundary.last.j);
    const auto [lowK, highK] = std::minmax(boundary.first.k, boundary.last.k);
    if (lowJ != highJ && lowK != highK) continue;  // a diagonal is a fault
    if (lowJ <= point.j && point.j <= highJ && lowK <= point.k && point.k <= highK) return number;
  }
  return 0;
}

// The nearest point inside an area that is free water.
std::optional<GridPoint> nearestFree(AdviceContext& context, const GridFacts& grid, int area,
                                     GridPoint from) {
  constexpr int kMost = 5;  // points away
  std::optional<GridPoint> nearest;
  int least = 0;
  for (int k = std::max(from.k - kMost, 1); k <= std::min(from.k + kMost, grid.noK - 2); ++k) {
    for (int j = std::max(from.j - kMost, 1); j <= std::min(from.j + kMost, grid.noJ - 2); ++j) {
      const int away = (j - from.j) * (j - from.j) + (k - from.k) * (k - from.k);
      if (nearest && away >= least) continue;
      if (grid.isWater(j, k) != true || (area == 1 && boundaryAt(context, {j, k}) != 0) ||
          isCovered(context, area, {j, k}))
        continue;
      nearest = GridPoint{j, k};
      least = away;
    }
  }
  return nearest;
}

void adviseSourcePoint(AdviceContext& context, int number, bool isSource) {
  const CSourceSinkObjectKvs& location = *context.model.sourceSink->GetItem(number);
  const GridPoint point = isSource ? location.source : location.sink;
  const int area = isSource ? location.sourceArea : location.sinkArea;
  const GridFacts* grid = context.grid(area);
  if (grid == nullptr || !grid->contains(point.j, point.k)) return;
  const char* what = isSource ? "Source" : "Sink";
  const int inBoundary = area == 1 ? boundaryAt(context, point) : 0;
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
  if (const std::optional<GridPoint> free = nearestFree(context, *grid, area, point))
    advice.fix =
        AdviceFix{fmt::format("Move {} {} to {}", isSource ? "source" : "sink", number, pointText(*free)),
                  {{advice.place.keyword, valueOf(*free)}}};
  advice.todo = fmt::format("Choose a point of water inside area {}.", area);
  context.add(std::move(advice));
}

// A line in a projection.
struct Line {
  PageId page;
  std::string thing;
  std::string path;
  int number;
  int count;
  std::optional<AdviceRemoval::List> list;  // nothing for dikes, which can be left out of use
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

// A structure that takes no part any more: a dike is left out of use.
AdviceFix outOfUse(const Line& line) {
  if (!line.list) return {fmt::format("{} out of use", capital(line.thing)), {{line.path + "/include", "0"}}};
  return {fmt::format("{} out", capital(line.thing)), {}, {}, AdviceRemoval{*line.list, line.number}};
}

// Whether a line, in a projection, lies outside of area 1 for certain: all on one side. One may also pass
// through with no point inside. Nothing where that can't be told.
std::optional<bool> isOutside(AdviceContext& context, const Line& line, const std::string& projection) {
  const GridFacts* grid = context.grid(1);
  if (grid == nullptr) return std::nullopt;
  // Of a very long line some of its points tell.
  constexpr std::size_t kMost = 1000;
  std::vector<AdviceSite::MapPoint> some;
  for (std::size_t i = 0; i < line.points.size(); i += line.points.size() / kMost + 1)
    some.push_back(line.points[i]);
  some.push_back(line.points.back());
  std::optional<std::vector<GridSpot>> spots = context.spotsOn(1, projection, some);
  if (!spots && CVdMapProjection::IsLocal(projection) && !grid->file.geography) {
    spots.emplace();
    for (const auto& [easting, northing] : some)
      spots->push_back({(easting - grid->file.axes[0].first) / grid->dx,
                        (northing - grid->file.axes[1].first) / grid->dy});
  }
  if (!spots) return std::nullopt;
  const auto beyond = [&](auto isBeyond) { return std::ranges::all_of(*spots, isBeyond); };
  const double half = 0.5;
  return beyond([&](GridSpot at) { return at.j < -half; }) ||
         beyond([&](GridSpot at) { return at.k < -half; }) ||
         beyond([&](GridSpot at) { return at.j > grid->noJ - half; }) ||
         beyond([&](GridSpot at) { return at.k > grid->noK - half; });
}

void adviseLine(AdviceContext& context, const Line& line) {
  const auto add = [&](std::string doubt, std::string reason, std::optional<AdviceFix> fix,
                       std::string todo = {}) {
    context.add({{},
                 std::move(doubt),
                 std::move(reason),
                 {.page = line.page,
                  .thing = line.thing,
                  .keyword = line.path + "/number_of_points",
                  .entries = {{line.number, line.count}}},
                 {.projection = line.projection, .mapPoints = line.points},
                 std::move(fix),
                 std::move(todo)});
  };
  const std::string subject = capital(line.thing);
  if (line.points.size() < 2) {
    return add(
        fmt::format("{} has {} point{}.", subject, line.points.size(), line.points.size() == 1 ? "" : "s"),
        "A line without two ends lies nowhere.", outOfUse(line));
  }
  const auto equal = std::ranges::adjacent_find(line.points);
  if (equal != line.points.end()) {
    const auto at = static_cast<std::size_t>(equal - line.points.begin());
    const bool isAll = line.points.size() == 2;
    add(fmt::format("Points {} and {} of {} are equal.", at + 1, at + 2, line.thing),
        "A piece of no length has no direction for the flow across it.",
        isAll ? outOfUse(line) : withoutPoint(context, line, at + 1),
        fmt::format("Take point {} out of the table.", at + 2));
    if (isAll) return;
  }
  if (isOutside(context, line, line.projection) != true) return;
  // Often the points were typed in the setup's own projection.
  const std::string& own = context.model.bathymetry->projection;
  const bool isOwn = !own.empty() && isOutside(context, line, own) == false;
  add(fmt::format("{} lies outside of all areas.", subject),
      isOwn ? "It has no effect. By the setup's own projection it would lie inside."
            : "It has no effect, unless its coordinates or its projection are wrong.",
      isOwn ? AdviceFix{"Projection of " + line.thing, {{line.path + "/coordinate_type", own}}}
            : outOfUse(line));
}

void adviseLineStructures(AdviceContext& context, PageId page, auto& list, AdviceRemoval::List removal,
                          std::string_view what, std::string_view path) {
  for (int number = 1; number <= list.GetCount(); ++number) {
    const LineStructure& structure = *list.GetItem(number);
    Line line{page,
              thingOf(what, number),
              fmt::format(fmt::runtime(path), number),
              number,
              list.GetCount(),
              removal,
              structure.coordinateType,
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
    for (int other = 1; other < number; ++other) adviseOverlap(context, grid, number, other);
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
  adviseLineStructures(context, PageId::weirs, *context.model.nhdWeir, AdviceRemoval::List::weir, "weir",
                       fmt::format("{}/WEIR/weir_data[{{}}]", kStructures));
  adviseLineStructures(context, PageId::culverts, *context.model.nhdCulvert, AdviceRemoval::List::culvert,
                       "culvert", fmt::format("{}/CULVERTS/Culvert_data[{{}}]", kStructures));
  CNhdDikeKvs& dikes = *context.model.nhdDike;
  for (int number = 1; number <= dikes.GetCount(); ++number) {
    const CNhdDikeObjectKvs& dike = *dikes.GetItem(number);
    if (dike.include == 0) continue;
    Line line{PageId::dikes,
              thingOf("dike", number),
              fmt::format("HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_{}", number),
              number,
              dikes.GetCount(),
              {},
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
