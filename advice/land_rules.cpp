// Doubts about what is land in the areas.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <numeric>

#include "advice/area_fixes.h"
#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "basic/nesting.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/surface_elevation.h"

namespace gridbay {
namespace {

struct Water {
  float level = 0;      // metres
  bool isKnown = true;  // else it may be higher somewhere
};

// The highest level that the water begins with or is given at boundaries, as far as that is known, and mean
// sea level at least.
Water highestWater(AdviceContext& context) {
  Water water;
  const auto take = [&water](float level) {
    if (std::isfinite(level)) water.level = std::max(water.level, level);
  };
  const auto itemOf = [](const UTsbSelection& file) { return file.items.empty() ? 1 : file.items.front(); };
  CNhdSurfaceElevationKvs& surfaces = *context.model.nhdSurfaceElevation;
  for (int number = 1; number <= surfaces.GetCount(); ++number) {
    const CNhdSurfaceElevationObjectKvs& surface = *surfaces.GetItem(number);
    if (surface.type == CNhdSurfaceElevationObjectKvs::kConstant) {
      take(surface.constantValue);
    } else if (const GridFacts* map =
                   context.files.grid(surface.map.fileName.absolute(), itemOf(surface.map))) {
      take(map->highest);
    } else {
      water.isKnown = false;
    }
  }
  CNhdBoundaryKvs& boundaries = *context.model.nhdBoundary;
  for (int number = 1; number <= boundaries.GetCount(); ++number) {
    using Boundary = CNhdBoundaryObjectKvs;
    const Boundary& boundary = *boundaries.GetItem(number);
    if (boundary.formulation != Boundary::kLevel) continue;
    if (boundary.dataFormat == Boundary::kConstant) {
      take(boundary.value);
      continue;
    }
    if (boundary.dataFormat == Boundary::kSineSeries) {
      take(boundary.referenceLevel + boundary.range / 2);
      continue;
    }
    const bool isSeries =
        boundary.dataFormat == Boundary::kType0File || boundary.dataFormat == Boundary::kType1File;
    const SeriesFacts* series =
        isSeries ? context.files.series(boundary.dataFile.fileName.absolute()) : nullptr;
    const std::size_t item = itemOf(boundary.dataFile);
    if (series != nullptr && series->hasValues && item >= 1 && item <= series->items.size()) {
      take(series->items[item - 1].highest);
    } else {
      water.isKnown = false;
    }
  }
  return water;
}

// Whether the area around has water where the corners of an area lie.
bool hasWaterAround(AdviceContext& context, int number) {
  const CBathymetryObjectKvs& area = *context.model.bathymetry->GetArea(number);
  const GridFacts* inner = context.grid(number);
  const GridFacts* outer = context.grid(area.enclosingArea);
  if (inner == nullptr || outer == nullptr) return false;
  const int lastJ = area.origin.j + (inner->noJ - 1) / kNestingRatio;
  const int lastK = area.origin.k + (inner->noK - 1) / kNestingRatio;
  const GridPoint corners[] = {area.origin, {lastJ, area.origin.k}, {lastJ, lastK}, {area.origin.j, lastK}};
  return std::ranges::any_of(corners, [&](GridPoint at) {
    return outer->contains(at.j, at.k) &&
           outer->lowestOfBlocks(at.j / outer->blockSize, at.k / outer->blockSize) < outer->landValue;
  });
}

// Depths that count downwards where all lies above the water, else the land value above the water, and at
// most that of the highest point. Where all may be flooded, or is land and lies above the water for another
// reason, it is above all; where none of what lies above the water is land, its higher half becomes land.
AdviceFix landFix(AdviceContext& context, int number, const GridFacts& grid, float highest, bool isInland) {
  AdviceFix fix;
  const Water water = highestWater(context);
  const bool isDry = grid.lowest > water.level;
  const bool isAllLand = grid.lowest >= grid.landValue;
  if (isAllLand && !isInland && isDry && water.isKnown && (number == 1 || hasWaterAround(context, number))) {
    fix.name = fmt::format("Turn the depths of area {} to elevations, in {}", number,
                           addAreaFile(context, fix, number, "turned", TurnedGrid{context.elevationItem()}));
    return fix;
  }
  float land = std::ceil(isAllLand && (isInland || isDry) ? highest : water.level) + 1;
  if (!isAllLand && isDry) {
    const float half = std::midpoint(grid.lowest, highest);
    land = std::max(std::floor(half), std::min(std::ceil(grid.lowest) + 1, half));
  }
  if (!isInland && !(isAllLand && isDry) && highest > water.level) land = std::min(land, highest);
  const std::size_t closed = isInland ? context.elevationItem() : 0;
  fix.name = fmt::format("Land value of {:.6g} m for area {}, in {}", land, number,
                         addAreaFile(context, fix, number, "land", LandValueGrid{land, closed}));
  return fix;
}

}  // namespace

void adviseLandValues(AdviceContext& context) {
  const bool isInland = context.model.moduleSelection->hydrodynamicFeatures == 0;
  for (int number = 1; number <= context.model.bathymetry->GetCount(); ++number) {
    const GridFacts* grid = context.grid(number);
    if (grid == nullptr || grid->landValue < 0 || !std::isfinite(grid->lowest)) continue;
    // A few points at the land value are gaps that a conversion has closed; many are the land itself.
    constexpr std::size_t kFew = 100;  // times as many others lie above the sea
    const bool areGaps = grid->pointsAtLand * kFew < grid->pointsAboveSea;
    const float highest = areGaps ? grid->highestOfOthers : grid->highest;
    const bool isAllLand = grid->lowest >= grid->landValue;
    // Of an area that is all sea, or is to be flooded whole, it is meant that none of it is land.
    const bool hasNoLand = number == 1 && !isInland && highest > 0 && highest < grid->landValue;
    if (!isAllLand && !hasNoLand) continue;
    // Without terrain there is nothing that could be mended; how high the water comes a file may tell that is
    // not read yet.
    if (isAllLand && grid->highest == grid->landValue) continue;
    if ((!isAllLand && highest <= highestWater(context).level) || !context.files.isComplete()) continue;
    context.add(
        {{},
         isAllLand
             ? fmt::format("No point of area {} lies below its land value of {:.6g} m: all of it is land.",
                           number, grid->landValue)
             : fmt::format("The highest point of area 1 lies at {:.6g} m, below its land value of {:.6g} "
                           "m: none of it is land.",
                           highest, grid->landValue),
         isAllLand ? "There is nothing to calculate in it."
                   : "All of its border is open, the high ground too.",
         placeOfAreaFile(context, number),
         {},
         landFix(context, number, *grid, highest, isInland)});
  }
}

}  // namespace gridbay
