#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "advice/rules.h"
#include "basic/grid_place.h"

// Fixes by which areas get other grid files, for the rules on areas.

namespace gridbay {

inline constexpr std::string_view kAreasPath = "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION";

// Where the file of an area is chosen.
PagePlace placeOfAreaFile(AdviceContext& context, int number);

GridFrame frameOf(const GridFacts& grid);
GridLocation locationOf(const GridFrame& frame);
// The projection that a grid's file names, with its zone; empty where it has local coordinates.
std::string projectionIn(const GridFacts& grid);
// Where the first point of a grid lies on the grid around it, by the coordinates of both; nothing where these
// do not tell, or tell of another world.
std::optional<GridSpot> spotByCoordinates(AdviceContext& context, const GridFacts& grid,
                                          const GridFrame& around);
GridPoint nearestTo(const GridSpot& spot);
// How far it is from there to a point of the grid around (metres), and whether that is on the point.
double metresTo(const GridSpot& spot, GridPoint point, const GridFrame& around);
bool isOnPoint(const GridFacts& grid, double metres);
// The last point of the grid around that an inner one with its first point at `origin` covers.
GridPoint lastPointOf(const GridFacts& inner, GridPoint origin);
// Whether an inner grid lies inside the outer one there.
bool nests(const GridFacts& inner, const GridFacts& outer, GridPoint origin);

// Adds a file to a fix that is made of an area's own, and takes its place under all keywords: its name, which
// ends with `what`.
std::string addAreaFile(AdviceContext& context, AdviceFix& fix, int number, std::string_view what,
                        FileMaking making);

// How the file of an area comes to lie at a point of the area around it.
enum class AreaPlacing {
  placed,    // its points stay, and its coordinates are those of the point
  resampled  // it has values at the points that nest there
};
// Adds such a file, what the area's origin is then, and the like for the areas inside it where they would lie
// elsewhere; the name of the area's own.
std::string addPlacedArea(AdviceContext& context, AdviceFix& fix, int number, GridPoint origin,
                          AreaPlacing placing);

}  // namespace gridbay
