#include "map/gis_values.h"

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "core/number_text.h"
#include "families/line_box.h"
#include "families/mass_budget.h"
#include "families/transport_results.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "map/grid_shapes.h"
#include "map/module_outputs.h"
#include "platform/files/paths.h"
#include "platform/tsb/tsb_file.h"
#include "platform/units/units.h"
#include "structures/structure_choices.h"

namespace gridbay {
namespace {

using Type = VectorLayer::Type;
using Fields = std::vector<VectorLayer::Field>;

// Between several texts in one attribute.
constexpr std::string_view kBetween = "; ";

VectorValue joined(const std::vector<std::string>& texts) {
  return textOr(fmt::format("{}", fmt::join(texts, kBetween)));
}

Fields operator+(Fields fields, const Fields& further) {
  fields.insert(fields.end(), further.begin(), further.end());
  return fields;
}

Fields endFields() {
  return {
      {"first_j", Type::whole}, {"first_k", Type::whole}, {"last_j", Type::whole}, {"last_k", Type::whole}};
}
GisValues endValues(GisSource& source, const MapFeature& feature) {
  const std::optional<GridShape> shape = shapeOf(source.root, feature.id);
  if (!shape || shape->points.size() < 2) return GisValues(endFields().size());
  return {wholeNumber(shape->points[0].j), wholeNumber(shape->points[0].k), wholeNumber(shape->points[1].j),
          wholeNumber(shape->points[1].k)};
}

// A data file with its items.
Fields dataFields() {
  return {{"file", Type::text}, {"items", Type::text}, {"item_names", Type::text}};
}
void appendData(GisValues& values, GisSource& source, const FileNameValue& name,
                std::span<const std::uint32_t> items) {
  values.insert(values.end(), {source.file(name), source.itemNumbers(items), source.itemNames(name, items)});
}

// Open boundaries

Fields boundaryFields() {
  return endFields() + Fields{{"value", Type::real}, {"unit", Type::text},     {"mean", Type::real},
                              {"range", Type::real}, {"period_s", Type::real}, {"phase", Type::real}} +
         dataFields();
}
GisValues boundaryValues(GisSource& source, const MapFeature& feature) {
  using Boundary = CNhdBoundaryObjectKvs;
  GisValues values = endValues(source, feature);
  const Boundary& boundary = source.root.nhdBoundary->at(feature.id.number);
  const bool isSine = boundary.dataFormat == Boundary::kSineSeries;
  const auto ofSine = [isSine](float value) { return isSine ? plainNumber(value) : VectorValue{}; };
  const QunUnit* unit = boundary.isFromFile() ? nullptr : qunBaseUnit(boundary.quantity());
  values.insert(
      values.end(),
      {boundary.dataFormat == Boundary::kConstant ? plainNumber(boundary.value) : VectorValue{},
       unit == nullptr ? VectorValue{} : textOr(std::string(unit->symbol)), ofSine(boundary.referenceLevel),
       ofSine(boundary.range), ofSine(boundary.period), ofSine(boundary.phase)});
  if (boundary.isFromFile()) appendData(values, source, boundary.dataFile.fileName, boundary.dataFile.items);
  return values;
}

// Mass budgets: a polygon may have several files, and none

Fields massFields() {
  return {{"titles", Type::text}, {"files", Type::text}, {"steps", Type::text}};
}
GisValues massValues(GisSource& source, const MapFeature& feature) {
  MassFileList* list = massFiles(source.root);
  std::vector<std::string> titles;
  std::vector<std::string> files;
  std::vector<std::string> steps;
  for (int number = 1; list != nullptr && number <= list->GetCount(); ++number) {
    const MassFile& file = *list->GetMassFile(number);
    if (file.polygon != feature.id.number) continue;
    const VectorValue name = source.file(file.file);
    const auto* named = std::get_if<std::string>(&name);
    titles.push_back(file.title);
    files.push_back(named == nullptr ? std::string() : *named);
    steps.push_back(fmt::format("{} to {} by {}", file.steps.first, file.steps.last, file.steps.interval));
  }
  return {joined(titles), joined(files), joined(steps)};
}

// Structures

Fields dikeFields() {
  return {
      {"included", Type::whole},     {"crest_variation", Type::whole}, {"crest_variation_name", Type::text},
      {"crest_level_m", Type::real}, {"coefficient", Type::real},      {"crest_file", Type::text},
      {"crest_item", Type::whole},   {"crest_item_name", Type::text}};
}
GisValues dikeValues(GisSource& source, const MapFeature& feature) {
  const CNhdDikeObjectKvs& dike = source.root.nhdDike->at(feature.id.number);
  GisValues values{wholeNumber(dike.include), wholeNumber(dike.crest()),
                   textOr(crestVariations().textOf(dike.crest())), dike.crestLevel,
                   dike.dischargeCoefficient};
  values.resize(dikeFields().size());
  if (dike.crest() != CNhdDikeObjectKvs::kInSpaceAndTime) return values;
  const auto item = static_cast<std::uint32_t>(dike.itemNumber);
  std::ranges::copy(GisValues{source.file(dike.crestLevelFile), wholeNumber(dike.itemNumber),
                              source.itemNames(dike.crestLevelFile, {&item, 1})},
                    values.end() - 3);
  return values;
}

Fields weirFields() {
  return {{"type", Type::whole},        {"type_name", Type::text}, {"valve", Type::whole},
          {"valve_name", Type::text},   {"datum_m", Type::real},   {"invert_level_m", Type::real},
          {"crest_level_m", Type::real}};
}
GisValues weirValues(GisSource& source, const MapFeature& feature) {
  const CNhdWeirObjectKvs& weir = source.root.nhdWeir->at(feature.id.number);
  return {wholeNumber(weir.type),
          textOr(weirTypes().textOf(weir.type)),
          wholeNumber(weir.valve),
          textOr(valves().textOf(weir.valve)),
          weir.datum,
          weir.invertLevel1,
          weir.crestLevel2};
}

Fields culvertFields() {
  return {{"geometry", Type::whole},  {"geometry_name", Type::text},     {"valve", Type::whole},
          {"valve_name", Type::text}, {"upstream_invert_m", Type::real}, {"downstream_invert_m", Type::real},
          {"length_m", Type::real},   {"manning_n", Type::real},         {"culverts", Type::whole},
          {"width_m", Type::real},    {"height_m", Type::real},          {"diameter_m", Type::real}};
}
GisValues culvertValues(GisSource& source, const MapFeature& feature) {
  const CNhdCulvertObjectKvs& culvert = source.root.nhdCulvert->at(feature.id.number);
  return {wholeNumber(culvert.geometryType),
          textOr(culvertGeometries().textOf(culvert.geometryType)),
          wholeNumber(culvert.valve),
          textOr(valves().textOf(culvert.valve)),
          culvert.upstreamInvert,
          culvert.downstreamInvert,
          culvert.length,
          culvert.manningN,
          wholeNumber(culvert.numberOfCulverts),
          culvert.sectionWidth,
          culvert.sectionHeight,
          culvert.diameter};
}

// What is written

Fields periodFields() {
  return {{"file", Type::text}, {"first_step", Type::whole}, {"last_step", Type::whole}};
}
GisValues periodValues(const GisSource& source, const UResultFileName& file, const USubLine& steps) {
  return {source.file(file), wholeNumber(steps.first), wholeNumber(steps.last)};
}

Fields outputFields() {
  return periodFields() + Fields{{"step_interval", Type::whole}};
}
GisValues outputValues(GisSource& source, const MapFeature& feature) {
  const auto told = [&source](const auto& output) {
    GisValues values = periodValues(source, output.file, output.steps);
    values.push_back(wholeNumber(output.steps.interval));
    return values;
  };
  if (const TransportOutput* output = moduleOutput(source.root, feature.id)) return told(*output);
  return told(source.root.nhdResult->outputs.at(feature.id.number));
}

GisValues boxValues(GisSource& source, const MapFeature& feature) {
  const LineOrBox* item = lineOrBox(source.root, feature.id);
  return item == nullptr ? GisValues{} : periodValues(source, item->file, item->steps);
}
GisValues dischargeValues(GisSource& source, const MapFeature& feature) {
  GisValues values = endValues(source, feature);
  std::ranges::move(boxValues(source, feature), std::back_inserter(values));
  return values;
}

}  // namespace

VectorValue textOr(std::string text) {
  return text.empty() ? VectorValue{} : VectorValue{std::move(text)};
}

VectorValue plainNumber(float number) {
  return doubleOfText(NumberText(number).view()).value_or(double{number});
}

GisSource::GisSource(CGlobalKvs& model, std::string_view setupPath)
    : root(model), folder_(folderOfFile(setupPath)) {}

VectorValue GisSource::file(const std::string& absolute) const {
  return absolute.empty() ? VectorValue{} : textOr(pathOnFile(absolute, folder_));
}

VectorValue GisSource::itemNumbers(std::span<const std::uint32_t> items) const {
  return textOr(fmt::format("{}", fmt::join(items, kBetween)));
}

VectorValue GisSource::itemNames(const FileNameValue& name, std::span<const std::uint32_t> items) {
  if (name.empty()) return {};
  const auto [known, isNew] = names_.try_emplace(name.absolute());
  if (isNew) {
    if (const Result<TsbFile> file = TsbFile::open(known->first)) {
      for (const TsbItem& item : file->definition().items) known->second.push_back(item.name);
    }
  }
  std::vector<std::string> chosen;
  for (const std::uint32_t item : items) {
    if (item >= 1 && item <= known->second.size()) chosen.push_back(known->second[item - 1]);
  }
  return joined(chosen);
}

std::vector<GisKind> gisKinds() {
  return {{MapKind::boundary, "open_boundaries", VectorShape::line, boundaryFields(), boundaryValues},
          {MapKind::massBudget, "mass_budgets", VectorShape::polygon, massFields(), massValues},
          {MapKind::dike, "dikes", VectorShape::line, dikeFields(), dikeValues},
          {MapKind::weir, "weirs", VectorShape::line, weirFields(), weirValues},
          {MapKind::culvert, "culverts", VectorShape::line, culvertFields(), culvertValues},
          {MapKind::outputMap, "output_areas", VectorShape::polygon, outputFields(), outputValues},
          {MapKind::outputLine, "output_lines", VectorShape::line, outputFields(), outputValues},
          {MapKind::outputPoints, "output_points", VectorShape::points, outputFields(), outputValues},
          {MapKind::discharge, "discharge_lines", VectorShape::line, endFields() + periodFields(),
           dischargeValues},
          {MapKind::box, "mass_boxes", VectorShape::polygon, periodFields(), boxValues}};
}

Fields flowFields() {
  return Fields{{"discharge_m3_s", Type::real}, {"velocity_m_s", Type::real}, {"direction_deg", Type::real}} +
         dataFields();
}

GisValues flowValues(GisSource& source, int number) {
  CNhdSourceSinkObjectKvs& flow = source.root.nhdSourceSink->at(number);
  const auto items = static_cast<std::size_t>(flow.NoItems(number));
  const bool isConstant = flow.dataFormat == CNhdSourceSinkObjectKvs::kConstant;
  const bool hasVelocity = items > 1;
  GisValues values{isConstant ? plainNumber(flow.constantMagnitude) : VectorValue{},
                   isConstant && hasVelocity ? plainNumber(flow.constantVelocity) : VectorValue{},
                   hasVelocity ? plainNumber(flow.outletDirection) : VectorValue{}};
  if (!isConstant) {
    const std::vector<std::uint32_t>& chosen = flow.dataFile.items;
    appendData(values, source, flow.dataFile.fileName,
               std::span(chosen).first(std::min(items, chosen.size())));
  }
  values.resize(flowFields().size());
  return values;
}

}  // namespace gridbay
