#include "map/gis_export.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>

#include "map/gis_values.h"
#include "map/grid_shapes.h"
#include "map/map_names.h"
#include "setup/dlg_enumerator.h"

namespace gridbay {
namespace {

using Type = VectorLayer::Type;

std::vector<std::array<double, 2>> pairsOf(std::span<const MapPoint> points) {
  std::vector<std::array<double, 2>> pairs;
  pairs.reserve(points.size());
  for (const MapPoint& point : points) pairs.push_back({point.east, point.north});
  return pairs;
}

VectorLayer areaLayer(const MapScene& scene, const GisSource& source) {
  VectorLayer layer{.name = "areas", .shape = VectorShape::polygon, .fields = {}, .features = {}};
  layer.fields = {{"number", Type::whole},   {"file", Type::text},       {"enclosing_area", Type::whole},
                  {"origin_j", Type::whole}, {"origin_k", Type::whole},  {"points_j", Type::whole},
                  {"points_k", Type::whole}, {"dx_m", Type::real},       {"dy_m", Type::real},
                  {"rotation", Type::real},  {"land_value", Type::real}, {"off_by_m", Type::real},
                  {"fault", Type::text}};
  for (const MapArea& area : scene.areas) {
    if (!area.isPlaced) continue;
    const bool isInner = area.number > 1;
    layer.features.push_back(
        {pairsOf(area.corners),
         {wholeNumber(area.number), source.file(area.file),
          isInner ? wholeNumber(area.enclosing) : VectorValue{},
          isInner ? wholeNumber(area.origin.j) : VectorValue{},
          isInner ? wholeNumber(area.origin.k) : VectorValue{}, wholeNumber(area.nx), wholeNumber(area.ny),
          area.dx, area.dy, area.rotation, plainNumber(area.landValue),
          area.offBy ? VectorValue{*area.offBy} : VectorValue{}, textOr(area.fault)}});
  }
  return layer;
}

std::vector<VectorLayer::Field> commonFields() {
  return {{"number", Type::whole}, {"name", Type::text},      {"page", Type::text},
          {"area", Type::whole},   {"driven_by", Type::text}, {"fault", Type::text}};
}

GisValues commonValues(const MapFeature& feature) {
  const std::string page(CDlgEnumerator().GetCaption(feature.id.page));
  return {wholeNumber(feature.id.number),
          textOr(feature.label),
          page,
          feature.area == 0 ? VectorValue{} : wholeNumber(feature.area),
          textOr(std::string(driveName(feature.drive))),
          textOr(feature.fault)};
}

std::size_t leastPoints(VectorShape shape) {
  if (shape == VectorShape::polygon) return 3;
  return shape == VectorShape::line ? 2 : 1;
}

// "Source 3 (Source and Sink)"
std::string nameOf(const MapFeature& feature) {
  return fmt::format("{} {} ({})", kindName(feature.id.kind), feature.id.number,
                     CDlgEnumerator().GetCaption(feature.id.page));
}

void append(GisValues& values, GisValues further) {
  std::ranges::move(further, std::back_inserter(values));
}

void addKind(GisSource& source, const MapScene& scene, const GisKind& kind, GisExport& made) {
  VectorLayer layer{
      .name = std::string(kind.name), .shape = kind.shape, .fields = commonFields(), .features = {}};
  layer.fields.insert(layer.fields.end(), kind.fields.begin(), kind.fields.end());
  for (const MapFeature& feature : scene.features) {
    if (feature.id.kind != kind.kind) continue;
    if (feature.points->size() < leastPoints(kind.shape)) {
      made.leftOut.push_back(nameOf(feature));
      continue;
    }
    GisValues values = commonValues(feature);
    append(values, kind.values(source, feature));
    values.resize(layer.fields.size());
    layer.features.push_back({pairsOf(*feature.points), std::move(values)});
  }
  if (!layer.features.empty()) made.file.layers.push_back(std::move(layer));
}

// The fields of a source's own point, and of the other one of a pair.
std::vector<VectorLayer::Field> pointFields() {
  return {{"kind", Type::text},          {"j", Type::whole},         {"k", Type::whole},
          {"partner_area", Type::whole}, {"partner_j", Type::whole}, {"partner_k", Type::whole}};
}

GisValues pointValues(const MapFeature& feature, const GridShape& shape, std::size_t at) {
  const bool isSink = feature.drive == MapDrive::sink || at == 1;
  GisValues values{std::string(isSink ? "sink" : "source"), wholeNumber(shape.points[at].j),
                   wholeNumber(shape.points[at].k)};
  values.resize(pointFields().size());
  if (shape.points.size() < 2) return values;
  const std::size_t other = 1 - at;
  std::ranges::copy(GisValues{wholeNumber(shape.areas[other]), wholeNumber(shape.points[other].j),
                              wholeNumber(shape.points[other].k)},
                    values.end() - 3);
  return values;
}

// Each point by itself, and the lines between the points of a pair.
void addSources(GisSource& source, const MapScene& scene, GisExport& made) {
  const auto layerOf = [](std::string name, VectorShape shape,
                          const std::vector<std::vector<VectorLayer::Field>>& parts) {
    VectorLayer layer{.name = std::move(name), .shape = shape, .fields = commonFields(), .features = {}};
    for (const auto& part : parts) layer.fields.insert(layer.fields.end(), part.begin(), part.end());
    return layer;
  };
  VectorLayer points = layerOf("sources_and_sinks", VectorShape::points, {pointFields(), flowFields()});
  VectorLayer pairs = layerOf("source_sink_pairs", VectorShape::line, {flowFields()});
  for (const MapFeature& feature : scene.features) {
    if (feature.id.kind != MapKind::source) continue;
    const std::optional<GridShape> shape = shapeOf(source.root, feature.id);
    if (!shape || shape->points.size() != feature.points->size()) {
      made.leftOut.push_back(nameOf(feature));
      continue;
    }
    const GisValues flow = flowValues(source, feature.id.number);
    for (std::size_t i = 0; i < shape->points.size(); ++i) {
      GisValues values = commonValues(feature);
      constexpr std::size_t kAreaPlace = 3;
      values[kAreaPlace] = wholeNumber(shape->areas[i]);
      append(values, pointValues(feature, *shape, i));
      append(values, flow);
      points.features.push_back({pairsOf({&(*feature.points)[i], 1}), std::move(values)});
    }
    if (feature.points->size() < 2) continue;
    GisValues values = commonValues(feature);
    append(values, flow);
    pairs.features.push_back({pairsOf(*feature.points), std::move(values)});
  }
  for (VectorLayer* layer : {&points, &pairs}) {
    if (!layer->features.empty()) made.file.layers.push_back(std::move(*layer));
  }
}

}  // namespace

GisExport gisLayers(CGlobalKvs& root, const MapScene& scene, std::string_view setupPath) {
  GisSource source(root, setupPath);
  GisExport made{{scene.projectionText, {areaLayer(scene, source)}}, {}};
  for (const MapArea& area : scene.areas) {
    if (!area.isPlaced) made.leftOut.push_back(fmt::format("Area {}", area.number));
  }
  for (const GisKind& kind : gisKinds()) addKind(source, scene, kind, made);
  addSources(source, scene, made);
  return made;
}

}  // namespace gridbay
