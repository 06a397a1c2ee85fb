#pragma once

#include <optional>
#include <vector>

#include "basic/bathymetry.h"
#include "map/grid_headers.h"
#include "map/map_coordinates.h"
#include "map/map_editor.h"

namespace gridbay {

// Half a cell beyond the outermost points of a grid: (0,0), last J, both last, last K.
std::array<MapPoint, 4> cornersOf(const MapGrid& grid, int nx, int ny);
// Of an area that lies in another one, by its own spacing (metres).
MapGrid gridWithin(const MapArea& outer, GridPoint origin, double dx, double dy);

// Where the file of an inner area says that it lies; nothing where the file, or the map, has no coordinates.
std::optional<MapPoint> ownPlace(const GridHeader& header, MapCoordinates& coordinates);

// All areas as the setup nests them. The map takes the projection of Area 1's file.
std::vector<MapArea> placeAreas(const CBathymetryKvs& areas, GridHeaders& headers,
                                MapCoordinates& coordinates);

// The point of an area nearest to a place on the map; nothing beyond its outline.
std::optional<GridPoint> pointAt(const MapArea& area, MapPoint place);
// The number of the finest area at a place; 0 where there is none.
std::int32_t finestAt(const std::vector<MapArea>& areas, MapPoint place);

// Whether an area, alone, nests in another one as far as spacings, extent and position tell. Both have grids.
bool nestsIn(const MapArea& inner, const MapArea& outer);

// Area `number` with its first point at the point of its enclosing area that is nearest to a place, and
// inside that area if it can be.
AreaPlace placeArea(const CBathymetryKvs& setup, const std::vector<MapArea>& areas, std::int32_t number,
                    MapPoint first);
// The nested area that a rectangle becomes.
AreaPlace placeNewArea(const CBathymetryKvs& setup, const std::vector<MapArea>& areas, MapPoint corner,
                       MapPoint opposite);

}  // namespace gridbay
