#pragma once

#include <optional>
#include <vector>

#include "advice/rules.h"

namespace gridbay {

// The points inside an area that are water and are covered by no embedded area and no boundary. Of a large
// grid those that are known: of a block that is not all water its deepest point.
class FreeWater {
 public:
  struct Place {
    GridPoint point;
    double metres = 0;  // away
  };

  // Of an area whose grid is known.
  FreeWater(AdviceContext& context, int area);

  // The nearest one to a point of the grid; nothing where there is none.
  std::optional<Place> nearest(GridPoint from) const;

 private:
  std::optional<int> next(int j, int k, bool isUp) const;
  bool isTaken(int& j, int k, bool isUp) const;

  const GridFacts& grid_;
  std::vector<std::vector<GridRectangle>> water_;  // by rising J, for each row of blocks
  std::vector<GridRectangle> taken_;
};

}  // namespace gridbay
