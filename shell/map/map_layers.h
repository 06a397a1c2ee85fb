#pragma once

#include <QColor>
#include <QString>
#include <array>
#include <bitset>

#include "map/map_scene.h"

namespace gridbay::shell {

// What can be shown and hidden, from the bottom to the top.
enum class MapLayer {
  terrain,
  gridLines,
  outlines,
  outputAreas,
  massBudgets,
  boundaries,
  discharges,
  outputLines,
  dikes,
  weirs,
  culverts,
  sources,
  outputPoints,
  advice,
  legend
};
inline constexpr std::size_t kMapLayers = 15;
using MapLayers = std::bitset<kMapLayers>;

QString layerName(MapLayer layer);
MapLayer layerOf(MapKind kind);
// The colour of a layer's lines, or one that stands for it in the list.
QColor layerColour(MapLayer layer);
// The colour of a feature by what drives it, and by its kind where nothing does.
QColor featureColour(const MapFeature& feature);
inline std::size_t placeOf(MapLayer layer) {
  return static_cast<std::size_t>(layer);
}

}  // namespace gridbay::shell
