#include "basic/boundary.h"

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/boundary_detection.h"
#include "core/table_code.h"

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
  auto* basic = parts<BasicParts>();
  const CBathymetryObjectKvs* area = basic == nullptr ? nullptr : basic->bathymetry->GetArea(1);
  if (area == nullptr) return -1.0F;
  if (first.j == last.j) return area->dy;
  return first.k == last.k ? area->dx : -1.0F;
}

void CBoundaryKvs::RecalculateBoundaries() {
  SetNoBoundaries(0);
  auto* basic = parts<BasicParts>();
  CBathymetryObjectKvs* area = basic == nullptr ? nullptr : basic->bathymetry->GetArea(1);
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
