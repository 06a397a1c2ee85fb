// Doubts about areas: where they lie, and their projections.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

#include "advice/area_fixes.h"
#include "basic/bathymetry.h"
#include "basic/grid_file.h"
#include "basic/nesting.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

// The corners of a grid that lies in another one with its first point at `origin`.
std::vector<GridPoint> cornersOf(const GridFacts& inner, GridPoint origin) {
  const GridPoint last = lastPointOf(inner, origin);
  return {origin, {last.j, origin.k}, last, {origin.j, last.k}};
}

// An area at another point of the area around it; a hot start file says so itself.
AdviceFix movedArea(AdviceContext& context, int number, int enclosing, GridPoint to) {
  AdviceFix fix;
  std::string copy;
  if (context.model.bathymetry->hotStart == 1)
    copy =
        ", in " + addAreaFile(context, fix, number, "placed", PlacedGrid{{}, HotStartPlace{enclosing, to}});
  fix.settings.push_back(
      {fmt::format("{}/AREA_{}/Origin", kAreasPath, number), fmt::format("{},{}", to.j, to.k)});
  if (enclosing == context.model.bathymetry->GetArea(number)->enclosingArea) {
    fix.name = fmt::format("Move area {} to {}{}", number, pointText(to), copy);
  } else {
    fix.name = fmt::format("Move area {} into area {}{}", number, enclosing, copy);
    fix.settings.push_back(
        {fmt::format("{}/AREA_{}/Enclosing_Area", kAreasPath, number), std::to_string(enclosing)});
  }
  return fix;
}

// A grid of an area whose points are those of the area around it. The state of a hot start belongs to its
// points, which stay.
AdviceFix nestedArea(AdviceContext& context, int number, GridPoint origin) {
  AdviceFix fix;
  if (context.model.bathymetry->hotStart == 1) {
    fix.name = fmt::format("Coordinates of area {} at point {}, in {}", number, pointText(origin),
                           addPlacedArea(context, fix, number, origin, AreaPlacing::placed));
  } else {
    fix.name = fmt::format("Values of area {} at points that nest, in {}", number,
                           addPlacedArea(context, fix, number, origin, AreaPlacing::resampled));
  }
  return fix;
}

// The setup's own place of an area for its coordinates.
AdviceFix placedArea(AdviceContext& context, int number) {
  AdviceFix fix;
  const GridPoint origin = context.model.bathymetry->GetArea(number)->origin;
  fix.name = fmt::format("Coordinates of area {} by its place in the setup, in {}", number,
                         addPlacedArea(context, fix, number, origin, AreaPlacing::placed));
  return fix;
}

// Another area that an area lies in by its file's coordinates, as one of those before it.
std::optional<AdviceFix> inAnotherArea(AdviceContext& context, int number) {
  const GridFacts& inner = *context.grid(number);
  for (int other = 1; other < number; ++other) {
    const GridFacts* outer = context.grid(other);
    if (outer == nullptr || !isOnPoint(inner, std::abs(inner.dx * kNestingRatio - outer->dx))) continue;
    const std::optional<GridSpot> spot = spotByCoordinates(context, inner, frameOf(*outer));
    if (!spot) continue;
    const GridPoint snapped = nearestTo(*spot);
    if (nests(inner, *outer, snapped) && isOnPoint(inner, metresTo(*spot, snapped, frameOf(*outer))))
      return movedArea(context, number, other, snapped);
  }
  return std::nullopt;
}

void advisePosition(AdviceContext& context, int number) {
  const CBathymetryObjectKvs& area = *context.model.bathymetry->GetArea(number);
  const GridFacts* inner = context.grid(number);
  const GridFacts* outer = area.enclosingArea == number ? nullptr : context.grid(area.enclosingArea);
  if (inner == nullptr || outer == nullptr) return;
  const GridFrame around = frameOf(*outer);
  const std::optional<GridSpot> spot = spotByCoordinates(context, *inner, around);
  if (!spot) return;
  const GridPoint snapped = nearestTo(*spot);
  const double off = metresTo(*spot, area.origin, around);
  const double residue = metresTo(*spot, snapped, around);
  if (isOnPoint(*inner, off)) return;
  const bool isInside = nests(*inner, *outer, snapped);
  std::optional<AdviceFix> fix;
  if (isInside) {
    fix = isOnPoint(*inner, residue) ? movedArea(context, number, area.enclosingArea, snapped)
                                     : nestedArea(context, number, snapped);
  } else if (fix = inAnotherArea(context, number); !fix) {
    // Where it lies inside by neither the check tells it.
    if (!nests(*inner, *outer, area.origin)) return;
    fix = placedArea(context, number);
  }
  Advice advice{
      {},
      fmt::format("Area {} lies at {} of area {}; by its file's coordinates it belongs at {}, {:.6g} m away.",
                  number, pointText(area.origin), area.enclosingArea, pointText(snapped), off),
      "Water passes between the two grids at points that are not the same place.",
      placeOfEntry(PageId::bathymetry, "area", {number, context.model.bathymetry->GetCount()},
                   fmt::format("{}/AREA_{}/Origin", kAreasPath, number), "Origin"),
      {.area = area.enclosingArea, .points = cornersOf(*inner, area.origin)},
      std::move(*fix)};
  if (snapped == area.origin) {
    advice.doubt = fmt::format(
        "Area {} lies at {} of area {}, the nearest point to where its file's coordinates put it, and yet "
        "{:.3g} m off: its points are not those of area {}.",
        number, pointText(area.origin), area.enclosingArea, off, area.enclosingArea);
  } else if (!isOnPoint(*inner, residue)) {
    advice.doubt += fmt::format(" That is the nearest point, {:.3g} m off.", residue);
  }
  if (!isInside) advice.doubt += fmt::format(" There it does not lie inside area {}.", area.enclosingArea);
  context.add(std::move(advice));
}

constexpr std::string_view kElsewhere =
    "What is placed by its coordinates, as structures, comes to lie elsewhere.";

std::string localText() {
  constexpr int kLocalCoordinates = 1;
  return CVdMapProjection::IDtoProjectionString(kLocalCoordinates);
}

// The projection of an area's file where there is such a one; empty with local coordinates, and where the
// file is not known.
std::string knownProjectionOf(AdviceContext& context, int number) {
  const GridFacts* grid = context.grid(number);
  const std::string projection = grid == nullptr ? std::string() : projectionIn(*grid);
  return context.files.projection(projection).IsValid() ? projection : std::string();
}

// A projection that the setup or one of its files knows, else local coordinates.
std::string anyKnownProjection(AdviceContext& context) {
  const std::string& own = context.model.bathymetry->projection;
  if (!CVdMapProjection::IsLocal(own) && context.files.projection(own).IsValid()) return own;
  for (int number = 1; number <= context.model.bathymetry->GetCount(); ++number) {
    if (const std::string known = knownProjectionOf(context, number); !known.empty()) return known;
  }
  return localText();
}

std::string nameOf(AdviceContext& context, const std::string& projection) {
  return projection.empty() ? "local coordinates" : context.files.projection(projection).Name();
}

// The projection of the setup against that of Area 1's file.
void adviseOwnProjection(AdviceContext& context) {
  const std::string& own = context.model.bathymetry->projection;
  const PagePlace place{PageId::bathymetry, {}, fmt::format("{}/Projection", kAreasPath), "Map projection:"};
  const auto projection = [&](std::string name, std::string text) {
    return AdviceFix{std::move(name), {{place.keyword, std::move(text)}}};
  };
  const std::string ofFile = knownProjectionOf(context, 1);
  if (!context.files.projection(own).IsValid()) {
    // What is not read yet may know one.
    if (ofFile.empty() && !context.files.isComplete()) return;
    const GridFacts* first = context.grid(1);
    const bool isLocal = first != nullptr && projectionIn(*first).empty();
    std::string known = !ofFile.empty() ? ofFile : isLocal ? localText() : anyKnownProjection(context);
    const std::string name = !ofFile.empty() ? "Projection of area 1: " + nameOf(context, known)
                             : CVdMapProjection::IsLocal(known)
                                 ? "Local coordinates"
                                 : "Projection of the grids: " + nameOf(context, known);
    return context.add({{},
                        fmt::format("There is no projection \"{}\".", own),
                        "Nothing can be placed by its coordinates.",
                        place,
                        {},
                        projection(name, std::move(known))});
  }
  if (own.empty() || ofFile.empty() || context.isSameProjection(own, ofFile)) return;
  context.add({{},
               fmt::format("The setup is in {}, the file of area 1 in {}.", nameOf(context, own),
                           nameOf(context, ofFile)),
               std::string(kElsewhere),
               place,
               {},
               projection("Projection of area 1: " + nameOf(context, ofFile), ofFile)});
}

// The projection of Area 1's file for one that names none that there is, or what else is known. Its longitude
// and latitude stay.
AdviceFix inKnownProjection(AdviceContext& context, int number) {
  const GridFacts& grid = *context.grid(number);
  const GridFacts* first = number > 1 ? context.grid(1) : nullptr;
  std::string projection = first != nullptr ? projectionIn(*first) : anyKnownProjection(context);
  if (!context.files.projection(projection).IsValid()) projection = anyKnownProjection(context);
  if (first != nullptr && CVdMapProjection::IsLocal(projection)) {
    const GridFacts* outer = context.grid(context.model.bathymetry->GetArea(number)->enclosingArea);
    if (outer != nullptr && projectionIn(*outer).empty()) return placedArea(context, number);
  }
  GridFrame frame = frameOf(grid);
  TsbGeography& place = *frame.geography;
  place.projection = projection;
  double easting = 0;
  double northing = 0;
  if (!context.files.projection(projection).Geo2Proj(place.longitude, place.latitude, &easting, &northing)) {
    projection.clear();
    frame.geography.reset();
  } else if (!place.isTurned() && (frame.firstX != 0 || frame.firstY != 0)) {
    frame.firstX = easting;
    frame.firstY = northing;
  }
  AdviceFix fix;
  fix.name = fmt::format("File of area {} in {}, in {}", number, nameOf(context, projection),
                         addAreaFile(context, fix, number, "placed", PlacedGrid{locationOf(frame)}));
  return fix;
}

// An area in the projection of Area 1, which the area around it has; nothing where it lies inside that by
// neither its coordinates nor the setup, which the check tells.
std::optional<AdviceFix> inProjectionOfArea1(AdviceContext& context, int number, const GridFacts& outer) {
  const GridFacts& grid = *context.grid(number);
  const std::optional<GridSpot> spot = spotByCoordinates(context, grid, frameOf(outer));
  // The state of a hot start belongs to its points.
  if (spot && !projectionIn(grid).empty() && nests(grid, outer, nearestTo(*spot)) &&
      context.model.bathymetry->hotStart != 1) {
    AdviceFix fix;
    fix.name = fmt::format("Values of area {} in the projection of area 1, in {}", number,
                           addPlacedArea(context, fix, number, nearestTo(*spot), AreaPlacing::resampled));
    return fix;
  }
  if (!nests(grid, outer, context.model.bathymetry->GetArea(number)->origin)) return std::nullopt;
  return placedArea(context, number);
}

void adviseFileProjection(AdviceContext& context, int number) {
  const GridFacts* grid = context.grid(number);
  if (grid == nullptr) return;
  const auto add = [&](std::string doubt, std::string_view reason, AdviceFix fix) {
    context.add(
        {{}, std::move(doubt), std::string(reason), placeOfAreaFile(context, number), {}, std::move(fix)});
  };
  const std::string own = projectionIn(*grid);
  if (!context.files.projection(own).IsValid()) {
    if (!context.files.isComplete()) return;
    return add(fmt::format("The file of area {} names a projection that there is not: \"{}\".", number, own),
               "Nothing can be placed by its coordinates.", inKnownProjection(context, number));
  }
  const GridFacts* first = context.grid(1);
  const GridFacts* outer = context.grid(context.model.bathymetry->GetArea(number)->enclosingArea);
  if (number > 1 && first != nullptr && outer != nullptr) {
    const std::string ofFirst = projectionIn(*first);
    // What lies further in goes with the area around it.
    if (context.files.projection(ofFirst).IsValid() && !context.isSameProjection(own, ofFirst) &&
        context.isSameProjection(projectionIn(*outer), ofFirst)) {
      if (std::optional<AdviceFix> fix = inProjectionOfArea1(context, number, *outer)) {
        add(fmt::format("The file of area {} is in {}, that of area 1 in {}.", number, nameOf(context, own),
                        nameOf(context, ofFirst)),
            "Their grids do not run in the same directions, and their points do not fall together.",
            std::move(*fix));
      }
    }
  }
  // Axes that begin at 0 are the grid's own.
  GridFrame frame = frameOf(*grid);
  const std::optional<GridPlace> place = context.placeOf(number);
  if (!place || frame.geography->isTurned() || (frame.firstX == 0 && frame.firstY == 0)) return;
  const double off = std::hypot(place->easting - frame.firstX, place->northing - frame.firstY);
  if (off <= std::min(grid->dx, grid->dy) / 2) return;
  std::string doubt = fmt::format(
      "The axes of area {}'s file begin at {:.8g}, {:.8g}; its longitude and latitude lie at {:.8g}, {:.8g} "
      "in {}, {:.6g} m away.",
      number, frame.firstX, frame.firstY, place->easting, place->northing, nameOf(context, own), off);
  frame.firstX = place->easting;
  frame.firstY = place->northing;
  AdviceFix fix;
  fix.name = fmt::format("Axes of area {}'s file from its longitude and latitude, in {}", number,
                         addAreaFile(context, fix, number, "placed", PlacedGrid{locationOf(frame)}));
  add(std::move(doubt), "One of the two is wrong, and other programs may go by the other one.",
      std::move(fix));
}

void adviseStructureProjection(AdviceContext& context, PagePlace place, const std::string& projection) {
  std::string known = anyKnownProjection(context);
  const bool isLocal = CVdMapProjection::IsLocal(known);
  // Without one its points are those of a grid that has none either.
  if (projection.empty() ? isLocal : context.files.projection(projection).IsValid()) return;
  if (isLocal && !context.files.isComplete()) return;
  AdviceFix fix{fmt::format("Projection of {}: {}", place.thing, nameOf(context, known)),
                {{place.keyword, known}}};
  context.add({{},
               projection.empty() ? fmt::format("{} names no projection.", capital(place.thing))
                                  : fmt::format("There is no projection \"{}\", in which {} is given.",
                                                projection, place.thing),
               "The engine can't place it on the grid.",
               std::move(place),
               {},
               std::move(fix)});
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

}  // namespace gridbay
