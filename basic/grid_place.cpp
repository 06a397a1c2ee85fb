#include "basic/grid_place.h"

namespace gridbay {

std::optional<GridSpot> spotOfGrid(const GridFrame& grid, const GridFrame& around,
                                   const CVdMapProjection& projection) {
  const auto isLocal = [](const GridFrame& each) {
    return !each.geography || CVdMapProjection::IsLocal(each.geography->projection);
  };
  if (isLocal(grid) != isLocal(around)) return std::nullopt;
  if (isLocal(grid)) {
    if (grid.firstX == 0 && grid.firstY == 0) return std::nullopt;
    return GridSpot{(grid.firstX - around.firstX) / around.dx, (grid.firstY - around.firstY) / around.dy};
  }
  double easting = 0;
  double northing = 0;
  double firstEasting = 0;
  double firstNorthing = 0;
  const auto place = [&projection](const TsbGeography& of, double* east, double* north) {
    return projection.Geo2Proj(of.longitude, of.latitude, east, north);
  };
  if (!place(*grid.geography, &easting, &northing) ||
      !place(*around.geography, &firstEasting, &firstNorthing))
    return std::nullopt;
  GridSpot spot;
  CVdCartography({}, firstEasting, firstNorthing, around.geography->rotation)
      .Proj2Xy(easting, northing, &spot.j, &spot.k);
  return GridSpot{spot.j / around.dx, spot.k / around.dy};
}

}  // namespace gridbay
