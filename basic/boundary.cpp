#include "basic/boundary.h"

#include <array>

#include "basic/bathymetry.h"
#include "basic/boundary_detection.h"
#include "core/global_kvs.h"
#include "hydrodynamic/boundary.h"

namespace gridbay {

void CBoundaryObjectKvs::Set(int firstX, int firstY, int lastX, int lastY) {
  first = {firstX, firstY};
  last = {lastX, lastY};
}

unsigned CBoundaryObjectKvs::Validate(ValidationList& messages, int) {
  const auto fault = [&messages](const gridbay::Text& text) {
    return report(messages, PageId::boundary, Severity::fault, text);
  };
  unsigned faults = 0;
  if (first.j < 0 || first.k < 0) faults += fault(texts::firstPointNegative);
  if (last.j < 0 || last.k < 0) faults += fault(texts::lastPointNegative);
  if (first.j != last.j && first.k != last.k) faults += fault(texts::lineNotParallel);
  return faults;
}

std::string CBoundaryObjectKvs::Text() const {
  return formatted(texts::boundaryText, first.j, first.k, last.j, last.k);
}

float CBoundaryObjectKvs::CellSpacing() {
  CGlobalKvs* root = model();
  const CBathymetryObjectKvs* area = root == nullptr ? nullptr : root->bathymetry->GetArea(1);
  if (area == nullptr) return -1.0F;
  if (first.j == last.j) return area->dy;
  return first.k == last.k ? area->dx : -1.0F;
}

std::span<const Follower> CBoundaryKvs::followers() {
  static constexpr std::array kFollowers{&resizeFollower<&CGlobalKvs::nhdBoundary>};
  return kFollowers;
}

void CBoundaryKvs::RecalculateBoundaries() {
  SetNoBoundaries(0);
  CGlobalKvs* root = model();
  CBathymetryObjectKvs* area = root == nullptr ? nullptr : root->bathymetry->GetArea(1);
  ValidationList dropped;
  if (area == nullptr || area->ReadGrid(dropped, 1) != 0) return;
  const std::vector<BoundaryLine> lines = findOpenBoundaries(area->grid, area->landValue);
  SetNoBoundaries(static_cast<int>(lines.size()));
  for (int number = 1; number <= GetCount(); ++number) {
    const BoundaryLine& line = lines[static_cast<std::size_t>(number) - 1];
    GetItem(number)->Set(line.first.j, line.first.k, line.last.j, line.last.k);
  }
}

}  // namespace gridbay
