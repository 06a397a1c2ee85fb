// Doubts about what is land in the areas.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

#include "advice/area_fixes.h"
#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/surface_elevation.h"

namespace gridbay {
namespace {

// The highest level that the water begins with or is given at boundaries, as far as that is known, and mean
// sea level at least (metres).
float highestWater(AdviceContext& context) {
  float highest = 0;
  const auto take = [&highest](float level) {
    if (std::isfinite(level)) highest = std::max(highest, level);
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
    }
  }
  CNhdBoundaryKvs& boundaries = *context.model.nhdBoundary;
  for (int number = 1; number <= boundaries.GetCount(); ++number) {
    using Boundary = CNhdBoundaryObjectKvs;
    const Boundary& boundary = *boundaries.GetItem(number);
    if (boundary.formulation != Boundary::kLevel) continue;
    if (boundary.dataFormat == Boundary::kConstant) take(boundary.value);
    if (boundary.dataFormat == Boundary::kSineSeries) take(boundary.referenceLevel + boundary.range / 2);
    if (boundary.dataFormat != Boundary::kType0File && boundary.dataFormat != Boundary::kType1File) continue;
    const SeriesFacts* series = context.files.series(boundary.dataFile.fileName.absolute());
    const std::size_t item = itemOf(boundary.dataFile);
    if (series != nullptr && series->hasValues && item >= 1 && item <= series->items.size())
      take(series->items[item - 1].highest);
  }
  return highest;
}

// Depths that count downwards where all lies above the water, else the land value above the water, and at
// most that of the highest point; of inland flooding above all, as all may be flooded.
AdviceFix landFix(AdviceContext& context, int number, const GridFacts& grid, float highest, float water,
                  bool isInland) {
  AdviceFix fix;
  if (!isInland && grid.lowest > water) {
    fix.name = fmt::format("Turn the depths of area {} to elevations, in {}", number,
                           addAreaFile(context, fix, number, "turned", TurnedGrid{context.elevationItem()}));
    return fix;
  }
  float land = std::ceil(isInland ? highest : water) + 1;
  if (!isInland && highest > water) land = std::min(land, highest);
  fix.name =
      fmt::format("Land value of {:.6g} m for area {}, in {}", land, number,
                  addAreaFile(context, fix, number, "land", LandValueGrid{land, context.elevationItem()}));
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
    const float water = highestWater(context);
    if (!isAllLand && highest <= water) continue;
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
         landFix(context, number, *grid, highest, water, isInland)});
  }
}

}  // namespace gridbay
