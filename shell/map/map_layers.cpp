#include "shell/map/map_layers.h"

#include <QCoreApplication>

namespace gridbay::shell {
namespace {

struct Layer {
  const char* name;
  QRgb colour;
};
constexpr std::array<Layer, kMapLayers> kLayers{{
    {QT_TRANSLATE_NOOP("Map", "Terrain"), 0xFF21918C},
    {QT_TRANSLATE_NOOP("Map", "Grid lines"), 0xFF808080},
    {QT_TRANSLATE_NOOP("Map", "Areas"), 0xFF202020},
    {QT_TRANSLATE_NOOP("Map", "Output areas and boxes"), 0xFF6A51A3},
    {QT_TRANSLATE_NOOP("Map", "Mass budget polygons"), 0xFF9E5A00},
    {QT_TRANSLATE_NOOP("Map", "Open boundaries"), 0xFF1F6FD6},
    {QT_TRANSLATE_NOOP("Map", "Discharge lines"), 0xFF008B8B},
    {QT_TRANSLATE_NOOP("Map", "Output lines"), 0xFF6A51A3},
    {QT_TRANSLATE_NOOP("Map", "Dikes"), 0xFF7A3B12},
    {QT_TRANSLATE_NOOP("Map", "Weirs"), 0xFFB8007A},
    {QT_TRANSLATE_NOOP("Map", "Culverts"), 0xFF4B4B4B},
    {QT_TRANSLATE_NOOP("Map", "Sources and sinks"), 0xFF00A651},
    {QT_TRANSLATE_NOOP("Map", "Output points"), 0xFF6A51A3},
    {QT_TRANSLATE_NOOP("Map", "Advice"), 0xFFE0A800},
    {QT_TRANSLATE_NOOP("Map", "Scales and north"), 0xFF606060},
}};

const Layer& of(MapLayer layer) {
  return kLayers[placeOf(layer)];
}

}  // namespace

QString layerName(MapLayer layer) {
  return QCoreApplication::translate("Map", of(layer).name);
}

QColor layerColour(MapLayer layer) {
  return QColor(of(layer).colour);
}

MapLayer layerOf(MapKind kind) {
  switch (kind) {
    case MapKind::boundary:
      return MapLayer::boundaries;
    case MapKind::source:
      return MapLayer::sources;
    case MapKind::massBudget:
      return MapLayer::massBudgets;
    case MapKind::dike:
      return MapLayer::dikes;
    case MapKind::weir:
      return MapLayer::weirs;
    case MapKind::culvert:
      return MapLayer::culverts;
    case MapKind::outputMap:
      return MapLayer::outputAreas;
    case MapKind::outputLine:
      return MapLayer::outputLines;
    case MapKind::outputPoints:
      return MapLayer::outputPoints;
    case MapKind::discharge:
      return MapLayer::discharges;
    case MapKind::box:
      return MapLayer::outputAreas;
  }
  return MapLayer::outlines;
}

// Levels are blue, fluxes orange, what depends on the level purple.
QColor featureColour(const MapFeature& feature) {
  switch (feature.drive) {
    case MapDrive::levelConstant:
      return QColor(0x1F, 0x6F, 0xD6);
    case MapDrive::levelSeries:
      return QColor(0x00, 0xA3, 0xD9);
    case MapDrive::levelFile:
      return QColor(0x0B, 0x3C, 0x8C);
    case MapDrive::fluxConstant:
      return QColor(0xF0, 0x8A, 0x00);
    case MapDrive::fluxSeries:
      return QColor(0xFF, 0xB8, 0x3D);
    case MapDrive::fluxFile:
      return QColor(0xC2, 0x5A, 0x00);
    case MapDrive::ratingCurve:
      return QColor(0x8E, 0x3F, 0xB5);
    case MapDrive::source:
      return QColor(0x00, 0xA6, 0x51);
    case MapDrive::sink:
      return QColor(0x9C, 0x4F, 0x00);
    case MapDrive::pair:
      return QColor(0x00, 0x87, 0x8A);
    case MapDrive::off:
      return QColor(0x90, 0x90, 0x90);
    case MapDrive::none:
      break;
  }
  return layerColour(layerOf(feature.id.kind));
}

}  // namespace gridbay::shell
