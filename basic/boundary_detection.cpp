#include "basic/boundary_detection.h"

namespace gridbay {
namespace {

// Walks an edge of `length` points; `at` gives the grid point of an index along it.
void walkEdge(const CVdArray2D<float>& grid, float landValue, int length, auto at,
              std::vector<BoundaryLine>& lines) {
  int start = -1;
  for (int i = 0; i <= length; ++i) {
    const bool water = i < length && grid(at(i).j, at(i).k) < landValue;
    if (water && start < 0) start = i;
    if (!water && start >= 0) {
      lines.push_back({at(start), at(i - 1)});
      start = -1;
    }
  }
}

}  // namespace

std::vector<BoundaryLine> findOpenBoundaries(const CVdArray2D<float>& grid, float landValue) {
  const int jmax = grid.endJ() - 1;
  const int kmax = grid.endK() - 1;
  std::vector<BoundaryLine> lines;
  walkEdge(
      grid, landValue, kmax + 1,
      [](int k) {
        return GridPoint{0, k};
      },
      lines);
  walkEdge(
      grid, landValue, jmax + 1,
      [kmax](int j) {
        return GridPoint{j, kmax};
      },
      lines);
  walkEdge(
      grid, landValue, kmax + 1,
      [jmax](int k) {
        return GridPoint{jmax, k};
      },
      lines);
  walkEdge(
      grid, landValue, jmax + 1,
      [](int j) {
        return GridPoint{j, 0};
      },
      lines);
  return lines;
}

}  // namespace gridbay
