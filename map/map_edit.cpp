#include "map/map_edit.h"

#include <utility>

namespace gridbay {

MapEdit refusedEdit(std::string fault) {
  return {.fault = std::move(fault)};
}

std::string editKindName(MapKind kind) {
  switch (kind) {
    case MapKind::boundary:
      return "Boundary";
    case MapKind::source:
      return "Source";
    case MapKind::massBudget:
      return "Polygon";
    case MapKind::dike:
      return "Dike";
    case MapKind::weir:
      return "Weir";
    case MapKind::culvert:
      return "Culvert";
    case MapKind::discharge:
      return "Discharge line";
    case MapKind::box:
      return "Box";
    default:
      return "Output";
  }
}

}  // namespace gridbay
