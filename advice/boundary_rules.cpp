// Doubts about open boundaries: where they lie, and what they drive there.

#include <fmt/format.h>

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "advice/rules.h"
#include "basic/boundary.h"
#include "basic/boundary_overlap.h"
#include "hydrodynamic/boundary.h"

namespace gridbay {
namespace {

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
  if (number > context.model.nhdBoundary->GetCount()) return fix;
  const CNhdBoundaryObjectKvs& flow = *context.model.nhdBoundary->GetItem(number);
  const bool isAlongJ = first.k == last.k;
  if (flow.tiltType == 0 || flow.tiltType == 1) {
    const int one = isAlongJ ? first.j : first.k;
    const int other = isAlongJ ? last.j : last.k;
    const int held = std::clamp(flow.tiltingPoint, std::min(one, other), std::max(one, other));
    if (held != flow.tiltingPoint)
      fix.settings.push_back(
          {fmt::format("HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_{}/Tilting_Point", number),
           std::to_string(held)});
  }
  using Flow = CNhdBoundaryObjectKvs;
  if (flow.dataFormat == Flow::kType1File || flow.dataFormat == Flow::kTransferFile)
    fix.name += "; its file along the line is to be made again";
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
  // Its places along J or K.
  BoundarySpan span() const {
    const auto [low, high] = isAlongJ() ? std::minmax(first.j, last.j) : std::minmax(first.k, last.k);
    return {low, high};
  }
  GridPoint at(int place) const { return isAlongJ() ? GridPoint{place, first.k} : GridPoint{first.j, place}; }
};

Run runOf(AdviceContext& context, int number) {
  const CBoundaryObjectKvs& boundary = *context.model.boundary->GetItem(number);
  return {boundary.first, boundary.last};
}

GridPoint withinGrid(const GridFacts& grid, GridPoint point) {
  return {std::clamp(point.j, 0, grid.noJ - 1), std::clamp(point.k, 0, grid.noK - 1)};
}

// What a boundary spans in the grid, along the edge that is nearest to it: of a diagonal the longer of its
// two extents, of a single point the whole edge.
Run onEdge(const GridFacts& grid, const Run& whole) {
  const int lastJ = grid.noJ - 1;
  const int lastK = grid.noK - 1;
  Run run{withinGrid(grid, whole.first), withinGrid(grid, whole.last)};
  if (whole.first == whole.last) {
    const auto [j, k] = run.first;
    const bool isNearK = std::min(j, lastJ - j) <= std::min(k, lastK - k);
    run = isNearK ? Run{{j, 0}, {j, lastK}} : Run{{0, k}, {lastJ, k}};
  }
  const auto nearest = [](std::int32_t& a, std::int32_t& b, int last) { a = b = a + b <= last ? 0 : last; };
  if (std::abs(run.last.j - run.first.j) >= std::abs(run.last.k - run.first.k)) {
    nearest(run.first.k, run.last.k, lastK);
  } else {
    nearest(run.first.j, run.last.j, lastJ);
  }
  return run;
}

// The parts of a run that no boundary but one has.
std::vector<BoundarySpan> freeParts(AdviceContext& context, const Run& run, int number) {
  std::vector<BoundarySpan> free{run.span()};
  for (int other = 1; other <= context.model.boundary->GetCount(); ++other) {
    const Run each = runOf(context, other);
    if (other == number || each.first == each.last) continue;
    const std::optional<BoundarySpan> taken = commonOf(each, run);
    if (!taken) continue;
    std::vector<BoundarySpan> left;
    for (const BoundarySpan part : free) {
      if (part.low < taken->low) left.push_back({part.low, std::min(part.high, taken->low - 1)});
      if (part.high > taken->high) left.push_back({std::max(part.low, taken->high + 1), part.high});
    }
    free = std::move(left);
  }
  return free;
}

// The longest part of a boundary on the border that no other boundary has and that ends in water; of a single
// point the water around it. Without a grid its own points are all that is known. Nothing where there are no
// two such points.
std::optional<Run> usablePart(AdviceContext& context, const GridFacts* grid, int number) {
  const Run whole = runOf(context, number);
  const Run run = grid == nullptr ? whole : onEdge(*grid, whole);
  const bool isPoint = whole.first == whole.last;
  const auto isWater = [&](int place) {
    const auto [j, k] = run.at(place);
    return grid == nullptr || grid->landValue < 0 || grid->isWaterAtBorder(j, k);
  };
  std::optional<BoundarySpan> best;
  const auto lengthOf = [](BoundarySpan part) { return std::int64_t{part.high} - part.low; };
  for (BoundarySpan part : freeParts(context, run, number)) {
    if (isPoint) {
      const GridPoint point = withinGrid(*grid, whole.first);
      const int middle = run.isAlongJ() ? point.j : point.k;
      if (middle < part.low || middle > part.high || !isWater(middle)) continue;
      const BoundarySpan free = std::exchange(part, {middle, middle});
      while (part.low > free.low && isWater(part.low - 1)) --part.low;
      while (part.high < free.high && isWater(part.high + 1)) ++part.high;
    } else {
      // Of a line land within it is a part.
      while (part.low < part.high && !isWater(part.low)) ++part.low;
      while (part.low < part.high && !isWater(part.high)) --part.high;
    }
    if (lengthOf(part) > (best ? lengthOf(*best) : 0)) best = part;
  }
  if (!best) return std::nullopt;
  const Run part{run.at(best->low), run.at(best->high)};
  const bool isRising = run.first == run.at(run.span().low);
  return isRising ? part : Run{part.last, part.first};
}

// The part of a boundary that can drive something; one that has none goes.
AdviceFix usableBoundary(AdviceContext& context, const GridFacts* grid, int number) {
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
    advice.fix = usableBoundary(context, &grid, number);
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
  const Run run{first, last};
  const auto [low, high] = run.span();
  const auto isWater = [&grid](GridPoint point) { return grid.isWaterAtBorder(point.j, point.k); };
  int wet = 0;
  for (int place = low; place <= high; ++place) wet += isWater(run.at(place)) ? 1 : 0;
  const int all = high - low + 1;
  if (wet == 0) {
    return add(fmt::format("Boundary {} from {} to {} lies wholly on land.", number, pointText(first),
                           pointText(last)),
               "No water comes in or goes out there.");
  }
  if (isWater(first) && isWater(last)) return false;
  return add(fmt::format("Boundary {} from {} to {} ends on land: {} of its {} points are land.", number,
                         pointText(first), pointText(last), all - wet, all),
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
  advice.fix = usableBoundary(context, grid, number);
  context.add(std::move(advice));
}

}  // namespace

std::optional<GridRectangle> pointsOf(const CBoundaryObjectKvs& boundary) {
  const auto [lowJ, highJ] = std::minmax(boundary.first.j, boundary.last.j);
  const auto [lowK, highK] = std::minmax(boundary.first.k, boundary.last.k);
  if (lowJ != highJ && lowK != highK) return std::nullopt;
  return GridRectangle{lowJ, highJ, lowK, highK};
}

void adviseBoundaries(AdviceContext& context) {
  const GridFacts* grid = context.grid(1);
  for (int number = 1; number <= context.model.boundary->GetCount(); ++number) {
    if (grid != nullptr && adviseBoundary(context, *grid, number)) continue;
    for (int other = 1; other < number; ++other) adviseOverlap(context, grid, number, other);
  }
}

}  // namespace gridbay
