#include "advice/removal.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <utility>

#include "hydrodynamic/result.h"
#include "setup/entry_removal.h"
#include "setup/global_kvs.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

using List = AdviceRemoval::List;

void removeEqualPoints(LineStructure& line) {
  const std::size_t size = std::min(line.x.size(), line.y.size());
  std::size_t kept = std::min<std::size_t>(size, 1);
  for (std::size_t i = 1; i < size; ++i) {
    if (line.x[i] == line.x[kept - 1] && line.y[i] == line.y[kept - 1]) continue;
    line.x[kept] = line.x[i];
    line.y[kept++] = line.y[i];
  }
  line.x.resize(kept);
  line.y.resize(kept);
}

// The points before the first that goes stay shared with copies of the dike.
void removeEqualPoints(CNhdDikeObjectKvs& dike) {
  const SharedArray<DikePoint> points = dike.points;
  const auto isEqual = [&](std::size_t i) {
    return points[i].x == points[i - 1].x && points[i].y == points[i - 1].y;
  };
  std::size_t next = std::min<std::size_t>(points.size(), 1);
  while (next < points.size() && !isEqual(next)) ++next;
  dike.points.resize(next);
  for (; next < points.size(); ++next) {
    if (!isEqual(next)) dike.points.push_back(points[next]);
  }
}

template <class Entries>
void makeRemoval(Entries& entries, const AdviceRemoval& removal) {
  if (removal.what == AdviceRemoval::What::equalPoints) {
    removeEqualPoints(entries.at(removal.number));
  } else {
    removeEntry(entries, removal.number);
  }
}

}  // namespace

void makeRemoval(CGlobalKvs& model, const AdviceRemoval& removal) {
  switch (removal.list) {
    case List::boundary:
      return removeBoundary(model, removal.number);
    case List::source:
      return removeSource(model, removal.number);
    case List::weir:
      return makeRemoval(*model.nhdWeir, removal);
    case List::culvert:
      return makeRemoval(*model.nhdCulvert, removal);
    case List::dike:
      return makeRemoval(*model.nhdDike, removal);
    case List::output:
      return removeEntry(model.nhdResult->outputs, removal.number);
  }
}

std::string textOf(const AdviceRemoval& removal) {
  constexpr std::array kNames{"boundary", "source", "weir", "culvert", "dike", "output"};
  const bool isOfPoints = removal.what == AdviceRemoval::What::equalPoints;
  return fmt::format("{}{} {}", isOfPoints ? "equal points of " : "",
                     kNames[static_cast<std::size_t>(removal.list)], removal.number);
}

}  // namespace gridbay
