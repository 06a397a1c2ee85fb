#include "map/gis_export.h"

#include <fmt/format.h>

#include "hydrodynamic/result.h"
#include "map/grid_shapes.h"
#include "map/map_names.h"
#include "map/structure_lines.h"
#include "setup/dlg_enumerator.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

using Type = VectorLayer::Type;
using Attribute = VectorValue;

Attribute textOr(const std::string& text) {
  return text.empty() ? Attribute{} : Attribute{text};
}
Attribute whole(std::int64_t number) {
  return number;
}

std::vector<std::array<double, 2>> pairsOf(std::span<const MapPoint> points) {
  std::vector<std::array<double, 2>> pairs;
  pairs.reserve(points.size());
  for (const MapPoint& point : points) pairs.push_back({point.east, point.north});
  return pairs;
}

VectorLayer areaLayer(const MapScene& scene) {
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
         {whole(area.number), area.file, isInner ? whole(area.enclosing) : Attribute{},
          isInner ? whole(area.origin.j) : Attribute{}, isInner ? whole(area.origin.k) : Attribute{},
          whole(area.nx), whole(area.ny), area.dx, area.dy, area.rotation, double{area.landValue},
          area.offBy ? Attribute{*area.offBy} : Attribute{}, textOr(area.fault)}});
  }
  return layer;
}

// A kind of feature as a layer: its name and shape, and what is told of it beside what all have.
struct KindLayer {
  MapKind kind;
  std::string_view name;
  VectorShape shape;
  std::vector<VectorLayer::Field> fields = {};
  std::vector<Attribute> (*values)(CGlobalKvs& root, const MapFeature& feature) = nullptr;
};

std::vector<Attribute> gridEnds(CGlobalKvs& root, const MapFeature& feature) {
  const std::optional<GridShape> shape = shapeOf(root, feature.id);
  if (!shape || shape->points.size() < 2) return {};
  return {whole(shape->points[0].j), whole(shape->points[0].k), whole(shape->points[1].j),
          whole(shape->points[1].k)};
}

std::vector<Attribute> outputValues(CGlobalKvs& root, const MapFeature& feature) {
  if (feature.id.page != static_cast<std::int32_t>(PageId::hdResult)) return {};
  const CNhdResultObjectKvs* output = root.nhdResult->outputs.GetItem(feature.id.number);
  if (output == nullptr) return {};
  return {textOr(output->file.text()), whole(output->steps.first), whole(output->steps.last),
          whole(output->steps.interval)};
}

std::vector<Attribute> dikeValues(CGlobalKvs& root, const MapFeature& feature) {
  const CNhdDikeObjectKvs& dike = root.nhdDike->at(feature.id.number);
  return {whole(dike.include), whole(dike.crest()), dike.crestLevel, dike.dischargeCoefficient,
          textOr(dike.crestLevelFile.text())};
}

std::vector<Attribute> weirValues(CGlobalKvs& root, const MapFeature& feature) {
  const CNhdWeirObjectKvs& weir = root.nhdWeir->at(feature.id.number);
  return {whole(weir.type), whole(weir.valve), weir.datum, weir.invertLevel1, weir.crestLevel2};
}

std::vector<Attribute> culvertValues(CGlobalKvs& root, const MapFeature& feature) {
  const CNhdCulvertObjectKvs& culvert = root.nhdCulvert->at(feature.id.number);
  return {whole(culvert.geometryType),
          whole(culvert.valve),
          culvert.upstreamInvert,
          culvert.downstreamInvert,
          culvert.length,
          culvert.manningN,
          whole(culvert.numberOfCulverts),
          culvert.sectionWidth,
          culvert.sectionHeight,
          culvert.diameter};
}

std::vector<KindLayer> kindLayers() {
  const std::vector<VectorLayer::Field> ends{
      {"first_j", Type::whole}, {"first_k", Type::whole}, {"last_j", Type::whole}, {"last_k", Type::whole}};
  const std::vector<VectorLayer::Field> output{{"file", Type::text},
                                               {"first_step", Type::whole},
                                               {"last_step", Type::whole},
                                               {"step_interval", Type::whole}};
  return {{MapKind::boundary, "open_boundaries", VectorShape::line, ends, gridEnds},
          {MapKind::massBudget, "mass_budgets", VectorShape::polygon},
          {MapKind::dike,
           "dikes",
           VectorShape::line,
           {{"included", Type::whole},
            {"crest_variation", Type::whole},
            {"crest_level_m", Type::real},
            {"coefficient", Type::real},
            {"crest_file", Type::text}},
           dikeValues},
          {MapKind::weir,
           "weirs",
           VectorShape::line,
           {{"type", Type::whole},
            {"valve", Type::whole},
            {"datum_m", Type::real},
            {"invert_level_m", Type::real},
            {"crest_level_m", Type::real}},
           weirValues},
          {MapKind::culvert,
           "culverts",
           VectorShape::line,
           {{"geometry", Type::whole},
            {"valve", Type::whole},
            {"upstream_invert_m", Type::real},
            {"downstream_invert_m", Type::real},
            {"length_m", Type::real},
            {"manning_n", Type::real},
            {"culverts", Type::whole},
            {"width_m", Type::real},
            {"height_m", Type::real},
            {"diameter_m", Type::real}},
           culvertValues},
          {MapKind::outputMap, "output_areas", VectorShape::polygon, output, outputValues},
          {MapKind::outputLine, "output_lines", VectorShape::line, output, outputValues},
          {MapKind::outputPoints, "output_points", VectorShape::points, output, outputValues},
          {MapKind::discharge, "discharge_lines", VectorShape::line, ends, gridEnds},
          {MapKind::box, "mass_boxes", VectorShape::polygon}};
}

std::vector<VectorLayer::Field> commonFields() {
  return {{"number", Type::whole}, {"name", Type::text},      {"page", Type::text},
          {"area", Type::whole},   {"driven_by", Type::text}, {"fault", Type::text}};
}

std::vector<Attribute> commonValues(const MapFeature& feature) {
  const std::string page(CDlgEnumerator().GetCaption(feature.id.page));
  return {whole(feature.id.number),
          textOr(feature.label),
          page,
          feature.area == 0 ? Attribute{} : whole(feature.area),
          textOr(std::string(driveName(feature.drive))),
          textOr(feature.fault)};
}

std::size_t leastPoints(VectorShape shape) {
  if (shape == VectorShape::polygon) return 3;
  return shape == VectorShape::line ? 2 : 1;
}

// Each point by itself, and the lines between the points of a pair.
void addSources(CGlobalKvs& root, const MapScene& scene, std::vector<VectorLayer>& layers, int& leftOut) {
  VectorLayer points{
      .name = "sources_and_sinks", .shape = VectorShape::points, .fields = commonFields(), .features = {}};
  VectorLayer pairs{
      .name = "source_sink_pairs", .shape = VectorShape::line, .fields = commonFields(), .features = {}};
  points.fields.push_back({"kind", Type::text});
  points.fields.push_back({"j", Type::whole});
  points.fields.push_back({"k", Type::whole});
  for (const MapFeature& feature : scene.features) {
    if (feature.id.kind != MapKind::source) continue;
    const std::optional<GridShape> shape = shapeOf(root, feature.id);
    if (!shape || shape->points.size() != feature.points->size()) {
      ++leftOut;
      continue;
    }
    for (std::size_t i = 0; i < shape->points.size(); ++i) {
      std::vector<Attribute> values = commonValues(feature);
      const bool isSink = feature.drive == MapDrive::sink || i == 1;
      constexpr std::size_t kAreaPlace = 3;
      values[kAreaPlace] = whole(shape->areas[i]);
      values.insert(values.end(), {Attribute{std::string(isSink ? "sink" : "source")},
                                   whole(shape->points[i].j), whole(shape->points[i].k)});
      points.features.push_back({pairsOf({&(*feature.points)[i], 1}), std::move(values)});
    }
    if (feature.points->size() > 1)
      pairs.features.push_back({pairsOf(*feature.points), commonValues(feature)});
  }
  for (VectorLayer* layer : {&points, &pairs}) {
    if (!layer->features.empty()) layers.push_back(std::move(*layer));
  }
}

}  // namespace

VectorFile gisLayers(CGlobalKvs& root, const MapScene& scene, int* leftOut) {
  int missing = 0;
  VectorFile file{scene.projectionText, {areaLayer(scene)}};
  for (const MapArea& area : scene.areas) missing += area.isPlaced ? 0 : 1;
  for (const KindLayer& kind : kindLayers()) {
    VectorLayer layer{
        .name = std::string(kind.name), .shape = kind.shape, .fields = commonFields(), .features = {}};
    layer.fields.insert(layer.fields.end(), kind.fields.begin(), kind.fields.end());
    for (const MapFeature& feature : scene.features) {
      if (feature.id.kind != kind.kind) continue;
      if (feature.points->size() < leastPoints(kind.shape)) {
        ++missing;
        continue;
      }
      std::vector<Attribute> values = commonValues(feature);
      std::vector<Attribute> own =
          kind.values == nullptr ? std::vector<Attribute>{} : kind.values(root, feature);
      own.resize(kind.fields.size());
      values.insert(values.end(), own.begin(), own.end());
      layer.features.push_back({pairsOf(*feature.points), std::move(values)});
    }
    if (!layer.features.empty()) file.layers.push_back(std::move(layer));
  }
  addSources(root, scene, file.layers, missing);
  if (leftOut != nullptr) *leftOut = missing;
  return file;
}

}  // namespace gridbay
