#pragma once

#include <string_view>

#include "map/map_scene.h"

// What is placed on a map in words. A host needs nothing of the model for them.

namespace gridbay {

// "Weir"
constexpr std::string_view kindName(MapKind kind) {
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
    case MapKind::outputMap:
    case MapKind::outputLine:
    case MapKind::outputPoints:
      break;
  }
  return "Output";
}

// "level, constant"; empty where nothing drives it.
constexpr std::string_view driveName(MapDrive drive) {
  switch (drive) {
    case MapDrive::levelConstant:
      return "level, constant";
    case MapDrive::levelSeries:
      return "level, sine series";
    case MapDrive::levelFile:
      return "level, file";
    case MapDrive::fluxConstant:
      return "flux, constant";
    case MapDrive::fluxSeries:
      return "flux, sine series";
    case MapDrive::fluxFile:
      return "flux, file";
    case MapDrive::ratingCurve:
      return "rating curve";
    case MapDrive::source:
      return "source";
    case MapDrive::sink:
      return "sink";
    case MapDrive::pair:
      return "pair";
    case MapDrive::off:
      return "not included";
    case MapDrive::none:
      break;
  }
  return {};
}

}  // namespace gridbay
