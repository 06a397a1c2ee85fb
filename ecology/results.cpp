#include "ecology/results.h"

#include <algorithm>
#include <array>

#include "ecology/model_definition.h"
#include "ecology/transport_texts.h"
#include "families/result_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/result.h"

namespace gridbay {
namespace {

constexpr std::string_view kAdditionalOutput = "ADDITIONAL_OPTIONAL_OUTPUT";
constexpr Text kAdditionalItem{"ADDITIONAL_ITEM_%d"};

// The size itself passes as a last point.
bool isOutside(const USubLine& line, std::int32_t lastPoint) {
  return line.first < 0 || line.last < 0 || line.first > lastPoint + 1 || line.last > lastPoint + 1;
}

// A range that runs backwards is told by a test of its own.
bool isWrongInterval(const USubLine& line) {
  const std::int64_t range = std::int64_t{line.last} - line.first;
  return line.interval < 1 || (range > 0 && line.interval > range);
}

bool areWrongSteps(const USubLine& steps, std::int32_t noSteps) {
  return steps.interval < 1 || steps.interval > noSteps || steps.first < 0 || steps.first > noSteps ||
         steps.last < 0 || steps.last > noSteps || steps.first > steps.last ||
         (steps.first == steps.last && steps.interval != 1);
}

// The extensions of a point, a line and a map.
constexpr std::array<std::array<std::string_view, 2>, 3> kExtensions{
    {{".tsb0", ".tb0"}, {".tsb1", ".tb1"}, {".tsb2", ".tb2"}}};

// The extension of a file's name, with its dot; empty for a name that has none.
std::string_view extensionOf(std::string_view path) {
  const std::size_t folder = path.find_last_of("/\\");
  const std::string_view name = folder == std::string_view::npos ? path : path.substr(folder + 1);
  const std::size_t dot = name.rfind('.');
  return dot == std::string_view::npos ? std::string_view() : name.substr(dot);
}

void writeAdditionalItem(const CSolverItem& item, int number, KvsFile& file) {
  kvsAddSection(file, formatted(kAdditionalItem, number));
  kvsPutParam(file, "ID", item.id);
  kvsPutParam(file, "Description", std::string_view(item.description));
  kvsPutParam(file, "Unit", std::string_view(item.unit));
  kvsPutParam(file, "Dimension", item.spatialVariation);
  kvsEndSection(file);
}

}  // namespace

void CWQSResultsItemKvs::Rebuild() {
  stateVariables.assign(static_cast<std::size_t>(stateVariableCount(*this)), 0);
  additionalItems.assign(static_cast<std::size_t>(additionalItemCount(*this)), 0);
}

unsigned CWQSResultsItemKvs::Validate(ValidationList& messages, int) {
  unsigned faults = 0;
  const auto check = [&](bool isWrong, const Text& text) {
    if (isWrong) faults += report(messages, PageId::ecoResults, Severity::fault, text);
    return isWrong;
  };
  const ResultLimits limits = resultLimits(*this, areaNumber);
  if (check(!limits.hasArea, texts::associatedAreaMissing)) return faults;
  check(isOutside(part.x, limits.lastJ) || isOutside(part.y, limits.lastK), texts::outputLimits);
  check(part.x.first > part.x.last || part.y.first > part.y.last, texts::outputStep);
  check(isWrongInterval(part.x) || isWrongInterval(part.y), texts::outputStep);
  if (check(areWrongSteps(steps, limits.lastStep + 1), texts::outputTimeSteps)) return 0;
  if (check(timeAveraged && steps.interval == 1, texts::averageOfOneStep)) return 0;
  const auto& allowed = kExtensions[static_cast<std::size_t>(extentOf(part))];
  check(std::ranges::find(allowed, extensionOf(file.text())) == allowed.end(), texts::wrongDimensionOfFile);
  check(chosenCount(stateVariables) + chosenCount(additionalItems) == 0, texts::noOutputItem);
  return faults;
}

void CWQSResultsKvs::Rebuild() {
  for (int number = 1; number <= outputs.GetCount(); ++number) outputs.at(number).Rebuild();
}

bool CWQSResultsKvs::hydrodynamicHotStart() {
  auto* flow = parts<HydrodynamicParts>();
  return flow != nullptr && flow->nhdResult->generateHotStart;
}

void CWQSResultsKvs::AdditionalOutputRow::save(const CWQSResultsKvs& object, KvsFile& file,
                                               const std::string&) const {
  const CWQSModelDefinitionKvs* model = modelDefinitionOf(const_cast<CWQSResultsKvs&>(object));
  kvsAddSection(file, kAdditionalOutput);
  kvsPutParam(file, "No_Of_Items", model == nullptr ? 0 : static_cast<int>(model->outputItems().size()));
  int number = 0;
  if (model != nullptr) {
    for (const CSolverItem* item : model->outputItems()) writeAdditionalItem(*item, ++number, file);
  }
  kvsEndSection(file);
}

bool CWQSResultsKvs::AdditionalOutputRow::access(CWQSResultsKvs& object, std::string_view path,
                                                 PathAccess& access) const {
  const PathStep step = stepOf(path);
  if (!sameName(step.first, kAdditionalOutput)) return false;
  if (step.isLast()) {
    access.isSection = true;
    if (access.what == PathAccess::What::write) save(object, *access.out, *access.documentPath);
    return true;
  }
  // One item. What an earlier model had here is not missed.
  const PathStep inner = stepOf(step.rest);
  const std::optional<int> number = numberIn(inner.first, kAdditionalItem);
  if (!number || !inner.isLast()) return false;
  const CWQSModelDefinitionKvs* model = modelDefinitionOf(object);
  const bool isThere =
      model != nullptr && *number >= 1 && static_cast<std::size_t>(*number) <= model->outputItems().size();
  if (!isThere && access.what != PathAccess::What::look) return false;
  access.isSection = true;
  if (access.what == PathAccess::What::write)
    writeAdditionalItem(*model->outputItems()[static_cast<std::size_t>(*number) - 1], *number, *access.out);
  return true;
}

}  // namespace gridbay
