// Doubts about areas: where they lie, their projections, and what is land.

#include <fmt/format.h>

#include <cmath>

#include "advice/rules.h"
#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "basic/nesting.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

constexpr std::string_view kSection = "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION";
constexpr double kNear = 0.25;  // of a spacing: what lies nearer than this lies on the point

PagePlace placeOfArea(AdviceContext& context, int number, std::string_view keyword,
                      std::string_view column = {}) {
  return placeOfEntry(PageId::bathymetry, "area", {number, context.model.bathymetry->GetCount()},
                      fmt::format("{}/AREA_{}/{}", kSection, number, keyword), column);
}

// Where the file of an area is chosen.
PagePlace placeOfFile(AdviceContext& context, int number) {
  return placeOfArea(context, number, "DATA_FILE/FILE_NAME", "Bathymetry");
}

// The corners of a grid that lies in another one with its first point at `origin`.
std::vector<GridPoint> cornersOf(const GridFacts& inner, GridPoint origin) {
  const GridPoint last{origin.j + (inner.noJ - 1) / kNestingRatio,
                       origin.k + (inner.noK - 1) / kNestingRatio};
  return {origin, {last.j, origin.k}, last, {origin.j, last.k}};
}

GridFrame frameOf(const GridFacts& grid) {
  return {grid.file.geography, grid.file.axes[0].first, grid.file.axes[1].first, grid.dx, grid.dy};
}

// Where the first point of a grid lies on the grid around it, by the coordinates of both; nothing where these
// do not tell.
std::optional<GridSpot> spotByCoordinates(AdviceContext& context, const GridFacts& grid,
                                          const GridFacts& around) {
  const std::string projection = around.file.geography ? around.file.geography->projection : std::string();
  return spotOfGrid(frameOf(grid), frameOf(around), context.files.projection(projection));
}

bool nests(const GridFacts& inner, const GridFacts& outer, GridPoint origin) {
  const GridPoint last = cornersOf(inner, origin)[2];
  return origin.j >= 1 && origin.k >= 1 && last.j <= outer.noJ - 2 && last.k <= outer.noK - 2;
}

GridPoint nearestTo(const GridSpot& spot) {
  return {static_cast<int>(std::lround(spot.j)), static_cast<int>(std::lround(spot.k))};
}

double metresTo(const GridSpot& spot, GridPoint point, const GridFacts& around) {
  return std::hypot((spot.j - point.j) * around.dx, (spot.k - point.k) * around.dy);
}

AdviceFix movedArea(std::string name, const PagePlace& origin, GridPoint to) {
  return {std::move(name), {{origin.keyword, fmt::format("{},{}", to.j, to.k)}}};
}

// Another area that an area lies in by its file's coordinates, as one of those before it.
std::optional<AdviceFix> inAnotherArea(AdviceContext& context, int number, const PagePlace& origin) {
  const GridFacts& inner = *context.grid(number);
  for (int other = 1; other < number; ++other) {
    const GridFacts* outer = context.grid(other);
    if (outer == nullptr || std::abs(inner.dx * kNestingRatio - outer->dx) > kNear * inner.dx) continue;
    const std::optional<GridSpot> spot = spotByCoordinates(context, inner, *outer);
    if (!spot || !(std::abs(spot->j) < outer->noJ) || !(std::abs(spot->k) < outer->noK)) continue;
    const GridPoint snapped = nearestTo(*spot);
    if (!nests(inner, *outer, snapped) || metresTo(*spot, snapped, *outer) > kNear * inner.dx) continue;
    AdviceFix fix = movedArea(fmt::format("Move area {} into area {}", number, other), origin, snapped);
    fix.settings.push_back(
        {fmt::format("{}/AREA_{}/Enclosing_Area", kSection, number), std::to_string(other)});
    return fix;
  }
  return std::nullopt;
}

void advisePosition(AdviceContext& context, int number) {
  const CBathymetryObjectKvs& area = *context.model.bathymetry->GetArea(number);
  const GridFacts* inner = context.grid(number);
  const GridFacts* outer = area.enclosingArea == number ? nullptr : context.grid(area.enclosingArea);
  if (inner == nullptr || outer == nullptr) return;
  const std::optional<GridSpot> spot = spotByCoordinates(context, *inner, *outer);
  constexpr double kMostSpacings = 1e6;  // further off it is in another world
  if (!spot || !(std::abs(spot->j) < kMostSpacings) || !(std::abs(spot->k) < kMostSpacings)) return;
  const GridPoint snapped = nearestTo(*spot);
  const double off = metresTo(*spot, area.origin, *outer);
  const double residue = metresTo(*spot, snapped, *outer);
  if (off <= kNear * std::min(inner->dx, inner->dy)) return;
  const bool isHotStart = context.model.bathymetry->hotStart == 1;
  Advice advice{{},
                {},
                "Water passes between the two grids at points that are not the same place.",
                placeOfArea(context, number, "Origin", "Origin"),
                {.area = area.enclosingArea, .points = cornersOf(*inner, area.origin)}};
  if (snapped == area.origin) {
    advice.doubt = fmt::format(
        "Area {} lies at {} of area {}, the nearest point to where its file's coordinates put it, and yet "
        "{:.3g} m "
        "off: its points are not those of area {}.",
        number, pointText(area.origin), area.enclosingArea, off, area.enclosingArea);
    advice.todo = fmt::format(
        "Make its grid again, with its first point on one of area {}: the map cuts such a grid from a "
        "raster.",
        area.enclosingArea);
  } else {
    advice.doubt = fmt::format(
        "Area {} lies at {} of area {}; by its file's coordinates it belongs at {}, {:.6g} m away.", number,
        pointText(area.origin), area.enclosingArea, pointText(snapped), off);
    if (residue > kNear * std::min(inner->dx, inner->dy))
      advice.doubt += fmt::format(" That is the nearest point, {:.3g} m off.", residue);
    if (!nests(*inner, *outer, snapped)) {
      advice.doubt += fmt::format(" There it does not lie inside area {}.", area.enclosingArea);
      if (!isHotStart) advice.fix = inAnotherArea(context, number, advice.place);
    } else if (!isHotStart) {
      advice.fix =
          movedArea(fmt::format("Move area {} to {}", number, pointText(snapped)), advice.place, snapped);
    }
    advice.todo = isHotStart ? "A hot start file says itself where its area lies: choose that of this setup."
                             : "Choose the grid that belongs there, or the area that encloses it.";
  }
  context.add(std::move(advice));
}

constexpr std::string_view kElsewhere =
    "What is placed by its coordinates, as structures, comes to lie elsewhere.";

// The projection of the setup against that of Area 1's file.
void adviseOwnProjection(AdviceContext& context) {
  const std::string& own = context.model.bathymetry->projection;
  PagePlace place{PageId::bathymetry, {}, fmt::format("{}/Projection", kSection), "Map projection:"};
  const GridFacts* grid = context.grid(1);
  // A projection without a zone is completed from the longitude.
  const bool fileKnows = grid != nullptr && grid->file.geography &&
                         grid->file.geography->projection != "UTM" &&
                         context.files.projection(grid->file.geography->projection).IsValid();
  const auto fix = [&]() -> std::optional<AdviceFix> {
    if (fileKnows)
      return AdviceFix{"Projection of area 1", {{place.keyword, grid->file.geography->projection}}};
    if (grid == nullptr || grid->file.geography) return std::nullopt;
    constexpr int kLocalCoordinates = 1;
    return AdviceFix{"Local coordinates",
                     {{place.keyword, CVdMapProjection::IDtoProjectionString(kLocalCoordinates)}}};
  };
  if (!context.files.projection(own).IsValid()) {
    return context.add({{},
                        fmt::format("There is no projection \"{}\".", own),
                        "Nothing can be placed by its coordinates.",
                        place,
                        {},
                        fix(),
                        "Choose the projection of the grids."});
  }
  if (own.empty() || !fileKnows || context.isSameProjection(own, grid->file.geography->projection)) return;
  context.add(
      {{},
       fmt::format("The setup is in {}, the file of area 1 in {}.", context.files.projection(own).Name(),
                   context.files.projection(grid->file.geography->projection).Name()),
       std::string(kElsewhere),
       place,
       {},
       fix()});
}

void adviseFileProjection(AdviceContext& context, int number) {
  const GridFacts* grid = context.grid(number);
  if (grid == nullptr) return;
  const auto add = [&](std::string doubt, std::string_view reason, std::string_view todo) {
    context.add(
        {{}, std::move(doubt), std::string(reason), placeOfFile(context, number), {}, {}, std::string(todo)});
  };
  const GridFacts* first = context.grid(1);
  const auto nameOf = [&](const GridFacts& facts) {
    return facts.file.geography ? context.files.projection(facts.file.geography->projection).Name()
                                : std::string("local coordinates");
  };
  if (grid->file.geography && grid->file.geography->projection != "UTM" &&
      !context.files.projection(grid->file.geography->projection).IsValid()) {
    return add(fmt::format("The file of area {} names a projection that there is not: \"{}\".", number,
                           grid->file.geography->projection),
               "Nothing can be placed by its coordinates.",
               "Make the file again with the projection that its terrain has, and choose it here.");
  }
  if (number > 1 && first != nullptr) {
    const bool differ =
        grid->file.geography.has_value() != first->file.geography.has_value() ||
        (grid->file.geography &&
         !context.isSameProjection(grid->file.geography->projection, first->file.geography->projection));
    if (differ) {
      add(fmt::format("The file of area {} is in {}, that of area 1 in {}.", number, nameOf(*grid),
                      nameOf(*first)),
          "Their grids do not run in the same directions, and their points do not fall together.",
          "Make the file again in the projection of area 1: an import of its terrain turns it.");
    }
  }
  // Axes that begin at 0 are the grid's own.
  const TsbGridAxis& x = grid->file.axes[0];
  const TsbGridAxis& y = grid->file.axes[1];
  const std::optional<GridPlace> place = context.placeOf(number);
  if (!place || grid->file.geography->isTurned() || (x.first == 0 && y.first == 0)) return;
  const double off = std::hypot(place->easting - x.first, place->northing - y.first);
  if (off <= std::min(grid->dx, grid->dy) / 2) return;
  add(fmt::format(
          "The axes of area {}'s file begin at {:.8g}, {:.8g}; its longitude and latitude lie at {:.8g}, "
          "{:.8g} in {}, {:.6g} m away.",
          number, x.first, y.first, place->easting, place->northing, nameOf(*grid), off),
      "One of the two is wrong, and other programs may go by the other one.",
      "Find out which of the two is right, and make the file again from its terrain.");
}

void adviseStructureProjection(AdviceContext& context, PagePlace place, const std::string& projection) {
  if (context.files.projection(projection).IsValid()) return;
  const GridFacts* grid = context.grid(1);
  std::optional<AdviceFix> fix;
  for (const std::string& known :
       {context.model.bathymetry->projection,
        grid != nullptr && grid->file.geography ? grid->file.geography->projection : std::string()}) {
    if (fix || known.empty() || !context.files.projection(known).IsValid()) continue;
    fix = AdviceFix{"Projection of " + place.thing, {{place.keyword, known}}};
  }
  context.add({{},
               fmt::format("There is no projection \"{}\", in which {} is given.", projection, place.thing),
               "The engine can't place it on the grid.",
               std::move(place),
               {},
               std::move(fix),
               "Choose the projection in which its points are given."});
}

}  // namespace

void adviseAreaPositions(AdviceContext& context) {
  for (int number = 2; number <= context.model.bathymetry->GetCount(); ++number)
    advisePosition(context, number);
}

void adviseProjections(AdviceContext& context) {
  adviseOwnProjection(context);
  for (int number = 1; number <= context.model.bathymetry->GetCount(); ++number)
    adviseFileProjection(context, number);
  const auto all = [&](PageId page, auto& list, std::string_view what, std::string_view path) {
    for (int number = 1; number <= list.GetCount(); ++number) {
      adviseStructureProjection(
          context,
          placeOfEntry(page, what, {number, list.GetCount()}, fmt::format(fmt::runtime(path), number)),
          list.GetItem(number)->coordinateType);
    }
  };
  all(PageId::weirs, *context.model.nhdWeir, "weir",
      "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/WEIR/weir_data[{}]/coordinate_type");
  all(PageId::culverts, *context.model.nhdCulvert, "culvert",
      "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/CULVERTS/Culvert_data[{}]/coordinate_type");
  all(PageId::dikes, *context.model.nhdDike, "dike",
      "HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_{}/coordinate_type");
}

void adviseLandValues(AdviceContext& context) {
  for (int number = 1; number <= context.model.bathymetry->GetCount(); ++number) {
    const GridFacts* grid = context.grid(number);
    if (grid == nullptr || grid->landValue < 0 || !std::isfinite(grid->lowest)) continue;
    const auto add = [&](std::string doubt, std::string_view reason, std::string_view todo) {
      context.add({{},
                   std::move(doubt),
                   std::string(reason),
                   placeOfFile(context, number),
                   {},
                   {},
                   std::string(todo)});
    };
    if (grid->lowest >= grid->landValue) {
      add(fmt::format("No point of area {} lies below its land value of {:.6g} m: all of it is land.", number,
                      grid->landValue),
          "There is nothing to calculate in it.",
          "Make its file again with a higher land value, or with the depths turned where they count "
          "downwards, and choose it here.");
    } else if (number == 1 && grid->highest > 0 && grid->highest < grid->landValue &&
               context.model.moduleSelection->hydrodynamicFeatures != 0) {
      // Of an area that is all sea, or is to be flooded whole, that is meant.
      add(fmt::format(
              "The highest point of area 1 lies at {:.6g} m, below its land value of {:.6g} m: none of it "
              "is land.",
              grid->highest, grid->landValue),
          "All of its border is open, the high ground too.",
          "Unless all of it is to be flooded, make its file again with a lower land value, and choose it "
          "here.");
    }
  }
}

}  // namespace gridbay
