#include "basic/mass_budget.h"

#include <algorithm>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "core/table_code.h"

namespace gridbay {
namespace {

constexpr GridPoint kNewCorner{1, 1};

}  // namespace

void CMassBudgetItemKvs::CornersRow::save(const CMassBudgetItemKvs& polygon, KvsFile& file,
                                          const std::string&) const {
  kvsPutParam(file, count, static_cast<std::int32_t>(polygon.corners.size()));
  int number = 0;
  for (const GridPoint& point : polygon.corners) {
    kvsPutListParam(file, formatted(corner, ++number), "ii", point.j, point.k);
  }
}

void CMassBudgetItemKvs::CornersRow::load(CMassBudgetItemKvs& polygon, KvsSection from,
                                          const std::string&) const {
  std::int32_t stated = 0;
  kvsGetParam(from, count, &stated, 1, 1);
  polygon.corners.clear();
  for (int number = 1; number <= std::min(stated, kvsGetNoKeywords(from)); ++number) {
    const std::string name = formatted(corner, number);
    if (kvsKeywordByNameNum(from, name, 1) == nullptr) continue;
    GridPoint point;
    kvsGetListParam(from, name, 1, "ii", &point.j, &point.k);
    polygon.corners.push_back(point);
  }
}

bool CMassBudgetItemKvs::CornersRow::access(CMassBudgetItemKvs& polygon, std::string_view path,
                                            PathAccess& access) const {
  constexpr std::int32_t kMostCorners = 32767;
  const bool isSet = access.what == PathAccess::What::set;
  if (sameName(path, count)) {
    auto number = static_cast<std::int32_t>(polygon.corners.size());
    if (isSet) kvsGetParam(access.in, count, &number, 1, 1);
    if (number >= 0 && number <= kMostCorners)
      polygon.corners.resize(static_cast<std::size_t>(number), kNewCorner);
    if (access.what == PathAccess::What::write)
      kvsPutParam(*access.out, count, static_cast<std::int32_t>(polygon.corners.size()));
    return true;
  }
  const std::optional<int> number = numberIn(path, corner);
  if (!number || *number < 1 || *number > static_cast<int>(polygon.corners.size())) return false;
  GridPoint& point = polygon.corners[static_cast<std::size_t>(*number) - 1];
  if (isSet) kvsGetListParam(access.in, path, 1, "ii", &point.j, &point.k);
  if (access.what == PathAccess::What::write)
    kvsPutListParam(*access.out, formatted(corner, *number), "ii", point.j, point.k);
  return true;
}

unsigned CMassBudgetItemKvs::Validate(ValidationList& messages, int) {
  auto* basic = parts<BasicParts>();
  const int areas = basic == nullptr ? 0 : basic->bathymetry->GetCount();
  const auto fault = [&messages](const Text& text) {
    return report(messages, PageId::massBudget, Severity::fault, text);
  };
  unsigned faults = 0;
  if (associatedArea > areas) faults += fault(texts::invalidAssociatedArea);
  if (corners.empty()) faults += fault(texts::tooFewCorners);
  const CBathymetryObjectKvs* area = basic == nullptr ? nullptr : basic->bathymetry->GetArea(associatedArea);
  if (area == nullptr) return faults;
  for (const GridPoint& point : corners) {
    const bool inside = 1 <= point.j && point.j < area->noJ - 1 && 1 <= point.k && point.k < area->noK - 1;
    if (!inside) faults += fault(texts::pointOutsideGrid);
  }
  return faults;
}

void CMassBudgetKvs::initialise(CMassBudgetItemKvs& polygon, int) {
  auto* basic = parts<BasicParts>();
  const CBathymetryObjectKvs* area = basic == nullptr ? nullptr : basic->bathymetry->GetArea(1);
  polygon.corners = {{1, 1}};
  if (area == nullptr) return;
  const std::int32_t lastJ = area->noJ - 2;
  const std::int32_t lastK = area->noK - 2;
  polygon.corners = {{1, 1}, {1, lastK}, {lastJ, lastK}, {lastJ, 1}};
}

int CMassBudgetKvs::GetMaxCorners() const {
  std::size_t most = 0;
  for (int number = 1; number <= GetCount(); ++number) most = std::max(most, GetItem(number)->corners.size());
  return static_cast<int>(most);
}

}  // namespace gridbay
