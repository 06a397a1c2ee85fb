#pragma once

#include <optional>

#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_types.h"

namespace gridbay {

// What a grid file says of where its points lie; metres.
struct GridFrame {
  std::optional<TsbGeography> geography;
  double firstX = 0;  // the first values of its axes
  double firstY = 0;
  double dx = 0;
  double dy = 0;
};

// A place on a grid, in spacings from its first point.
struct GridSpot {
  double j = 0;
  double k = 0;
};

// Where the first point of a grid lies on another one, whose projection is given, by what their files say:
// longitude and latitude, or axes in coordinates of their own. Nothing where these do not tell, as with axes
// that begin at 0, 0.
std::optional<GridSpot> spotOfGrid(const GridFrame& grid, const GridFrame& around,
                                   const CVdMapProjection& projection);

}  // namespace gridbay
