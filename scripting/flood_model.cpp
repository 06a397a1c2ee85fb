#include <stdexcept>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/item_rows.h"
#include "gridbay_setup/flood_models.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "scripting/flood_outputs.h"
#include "scripting/scripted_model.h"

namespace gridbay::scripting {
namespace {

constexpr std::int32_t kUserSpecified = 0;
constexpr std::int32_t kFromThreeItems = 2;  // a data format of sources beside those of the editor

// The area's entry in a list by area, which is alone from now on.
auto& onlyEntry(auto& list) {
  list.SetCount(1);
  return list.at(1);
}

static_assert(kMostObjects == kMostItems, "a script makes as many as the editor");

// Objects by the thousand million would take all memory there is, and with it the calling program.
void refuseHugeCount(int count, const char* what) {
  if (count > kMostObjects)
    throw std::invalid_argument("There may be " + std::to_string(kMostObjects) + " " + what +
                                " at most, not " + std::to_string(count));
}

std::uint32_t itemNumber(int number) {
  return static_cast<std::uint32_t>(number);
}

}  // namespace

FloodModel::FloodModel() : model_(std::make_shared<ScriptedModel>(true)) {}

void ShowMessagesWith(FloodModel& model, MessageBox show) {
  const auto guard = model.model_->lock();
  model.model_->setMessageBox(std::move(show));
}

void FloodModel::LoadFile(std::string fileName) {
  const auto guard = model_->lock();
  model_->load(fileName);
}

void FloodModel::SaveFile(std::string fileName) {
  const auto guard = model_->lock();
  static_cast<void>(model_->save(fileName, _GetErrorTexts()));
}

std::string FloodModel::GetFileExtension() {
  constexpr int kFilterExtension = 4;
  std::string_view rest = texts::flowModelDocument.format;
  for (int field = 0; field < kFilterExtension; ++field) rest.remove_prefix(rest.find('\n') + 1);
  return std::string(rest.substr(0, rest.find('\n')));
}

std::string FloodModel::_GetErrorTexts() {
  return model_->errorTexts();
}

void FloodModel::SetSimulationPeriod(DateTime start, DateTime end, float timeStep) {
  const auto guard = model_->lock();
  CSimulationPeriodKvs& period = *model_->root.simulationPeriod;
  period.start = modelTime(start);
  period.timeStepInterval = timeStep;
  const double steps = wholeSteps(wholeSeconds(period.start, modelTime(end)), double{timeStep});
  period.noPointsInTime = wholePart(steps + 1);
}

void FloodModel::setDryingFloodingDepth(float dryingDepth, float floodingDepth) {
  const auto guard = model_->lock();
  CAreaDescriptionKvs& depths = *model_->root.areaDescription;
  depths.dryingDepth = dryingDepth;
  depths.floodingDepth = floodingDepth;
}

void FloodModel::setCoarseBathymetryFile(std::string fileName) {
  const auto guard = model_->lock();
  CBathymetryKvs& areas = *model_->root.bathymetry;
  CBathymetryObjectKvs& area = areas.at(1);
  model_->setFileName(area.fileName, fileName);
  const auto dataFiles = ScriptedModel::lockDataFiles();
  ValidationList dropped;
  area.ReadGrid(dropped, 1);
  std::string projection;
  int coriolis = 0;
  areas.GetProjection(&projection, &coriolis);
  areas.projection = projection;
  areas.coriolis = false;
}

std::string FloodModel::getCoarseBathymetryFile() {
  const auto guard = model_->lock();
  return model_->root.bathymetry->at(1).fileName.text();
}

void FloodModel::setFineBathymetryFile(std::string fileName) {
  const auto guard = model_->lock();
  model_->setFileName(model_->root.bathymetry->overlandFile, fileName);
}

std::string FloodModel::getFineBathymetryFile() {
  const auto guard = model_->lock();
  return model_->root.bathymetry->overlandFile.text();
}

void FloodModel::setOverlandSolverOption(int option) {
  const auto guard = model_->lock();
  model_->root.bathymetry->overlandSolver = option == 1;
}

void FloodModel::setResistance_Value(double value) {
  const auto guard = model_->lock();
  CNhdResistanceKvs& resistance = *model_->root.nhdResistance;
  resistance.formulation = CNhdResistanceKvs::kManning;
  CNhdResistanceObjectKvs& entry = onlyEntry(resistance);
  entry.dataFormat = CNhdResistanceObjectKvs::kConstant;
  entry.constantValue = static_cast<float>(value);
}

void FloodModel::setResistance_File(std::string fileName, int item) {
  const auto guard = model_->lock();
  CNhdResistanceKvs& resistance = *model_->root.nhdResistance;
  resistance.formulation = CNhdResistanceKvs::kManning;
  CNhdResistanceObjectKvs& entry = onlyEntry(resistance);
  entry.dataFormat = CNhdResistanceObjectKvs::kDataFile;
  model_->setSelection(entry.map, fileName, item);
}

void FloodModel::setInitialCondition_Value(double value) {
  const auto guard = model_->lock();
  CNhdSurfaceElevationObjectKvs& entry = onlyEntry(*model_->root.nhdSurfaceElevation);
  entry.type = CNhdSurfaceElevationObjectKvs::kConstant;
  entry.constantValue = static_cast<float>(value);
}

void FloodModel::setInitialCondition_File(std::string fileName, int item) {
  const auto guard = model_->lock();
  CNhdSurfaceElevationObjectKvs& entry = onlyEntry(*model_->root.nhdSurfaceElevation);
  entry.type = CNhdSurfaceElevationObjectKvs::kFromFile;
  model_->setSelection(entry.map, fileName, item);
}

void FloodModel::setNoOfBndCondition(int count) {
  const auto guard = model_->lock();
  refuseHugeCount(count, "boundaries");
  model_->root.boundary->defaultPosition = kUserSpecified;
  model_->root.boundary->SetNoBoundaries(count);
}

int FloodModel::getNoOfBndConditions() {
  const auto guard = model_->lock();
  return model_->root.boundary->GetCount();
}

void FloodModel::setHDBndCondition_Value(int index, int firstJ, int firstK, int lastJ, int lastK,
                                         int formulation, double value) {
  const auto guard = model_->lock();
  CBoundaryObjectKvs* line = model_->root.boundary->GetItem(index);
  if (line == nullptr) return;
  line->Set(firstJ, firstK, lastJ, lastK);
  CNhdBoundaryObjectKvs& condition = model_->root.nhdBoundary->at(index);
  condition.formulation = formulation;
  condition.SetDataFormat(CNhdBoundaryObjectKvs::kConstant);
  condition.value = static_cast<float>(value);
}

void FloodModel::setHDBndCondition_File(int index, int firstJ, int firstK, int lastJ, int lastK,
                                        int formulation, int dataFormat, std::string fileName, int item) {
  const auto guard = model_->lock();
  CBoundaryObjectKvs* line = model_->root.boundary->GetItem(index);
  if (line == nullptr) return;
  line->Set(firstJ, firstK, lastJ, lastK);
  CNhdBoundaryObjectKvs& condition = model_->root.nhdBoundary->at(index);
  condition.formulation = formulation;
  condition.SetDataFormat(dataFormat);
  model_->setFileName(condition.dataFile.fileName, fileName);
  if (condition.dataFile.items.empty())
    throw std::invalid_argument("Boundary " + std::to_string(index) + " has data format " +
                                std::to_string(dataFormat) + ", which has no item to be number " +
                                std::to_string(item));
  condition.dataFile.items.front() = itemNumber(item);
}

void FloodModel::getHDBndCondition(int index, int& firstJ, int& firstK, int& lastJ, int& lastK,
                                   int& formulation, int& dataFormat, double& value, std::string& fileName,
                                   int& item) {
  const auto guard = model_->lock();
  const CBoundaryObjectKvs* line = model_->root.boundary->GetItem(index);
  if (line == nullptr) return;
  firstJ = line->first.j;
  firstK = line->first.k;
  lastJ = line->last.j;
  lastK = line->last.k;
  const CNhdBoundaryObjectKvs& condition = model_->root.nhdBoundary->at(index);
  formulation = condition.formulation;
  dataFormat = condition.dataFormat;
  if (dataFormat == CNhdBoundaryObjectKvs::kConstant) {
    value = condition.value;
    return;
  }
  fileName = condition.dataFile.fileName.text();
  if (!condition.dataFile.items.empty()) item = static_cast<int>(condition.dataFile.items.front());
}

void FloodModel::setNoOfSourceSink(int count) {
  const auto guard = model_->lock();
  refuseHugeCount(count, "sources");
  model_->root.sourceSink->SetNoSources(count);
}

int FloodModel::getNoOfSourceSink() {
  const auto guard = model_->lock();
  return model_->root.sourceSink->GetCount();
}

void FloodModel::setHDSourceSink_Value(int index, int type, int sourceJ, int sourceK, int sinkJ, int sinkK,
                                       double magnitude, double velocity, double outletDirection) {
  const auto guard = model_->lock();
  CSourceSinkObjectKvs* place = model_->root.sourceSink->GetItem(index);
  if (place == nullptr) return;
  place->type = type;
  place->source = {sourceJ, sourceK};
  place->sink = {sinkJ, sinkK};
  CNhdSourceSinkObjectKvs& flow = model_->root.nhdSourceSink->at(index);
  flow.dataFormat = CNhdSourceSinkObjectKvs::kConstant;
  flow.constantMagnitude = static_cast<float>(magnitude);
  flow.constantVelocity = static_cast<float>(velocity);
  flow.outletDirection = static_cast<float>(outletDirection);
}

namespace {

// The flow of source `index`, with its place set; null for one that is not there.
CNhdSourceSinkObjectKvs* placeSource(ScriptedModel& model, int index, int type, GridPoint source,
                                     GridPoint sink) {
  CSourceSinkObjectKvs* place = model.root.sourceSink->GetItem(index);
  if (place == nullptr) return nullptr;
  place->type = type;
  place->source = source;
  place->sink = sink;
  place->sourceArea = 1;
  place->sinkArea = 1;
  return &model.root.nhdSourceSink->at(index);
}

}  // namespace

void FloodModel::setHDSourceSink_File(int index, int type, int sourceJ, int sourceK, int sinkJ, int sinkK,
                                      std::string /*fileName*/, double outletDirection, int magnitudeItem,
                                      int velocityItem) {
  const auto guard = model_->lock();
  CNhdSourceSinkObjectKvs* flow = placeSource(*model_, index, type, {sourceJ, sourceK}, {sinkJ, sinkK});
  if (flow == nullptr) return;
  flow->dataFormat = CNhdSourceSinkObjectKvs::kFromFile;
  flow->outletDirection = static_cast<float>(outletDirection);
  flow->dataFile.items = {itemNumber(magnitudeItem), itemNumber(velocityItem)};
}

void FloodModel::setHDSourceSink_FileEx(int index, int type, int sourceJ, int sourceK, int sinkJ, int sinkK,
                                        std::string /*fileName*/, int item1, int item2, int item3) {
  const auto guard = model_->lock();
  CNhdSourceSinkObjectKvs* flow = placeSource(*model_, index, type, {sourceJ, sourceK}, {sinkJ, sinkK});
  if (flow == nullptr) return;
  flow->dataFormat = kFromThreeItems;
  flow->dataFile.items = {itemNumber(item1), itemNumber(item2), itemNumber(item3)};
}

void FloodModel::getHDSourceSink(int index, int& type, int& dataFormat, int& sourceJ, int& sourceK,
                                 int& sinkJ, int& sinkK, double& magnitude, double& velocity,
                                 double& outletDirection, std::string& /*fileName*/, int& item1, int& item2,
                                 int& item3) {
  const auto guard = model_->lock();
  const CSourceSinkObjectKvs* place = model_->root.sourceSink->GetItem(index);
  if (place == nullptr) return;
  type = place->type;
  sourceJ = place->source.j;
  sourceK = place->source.k;
  sinkJ = place->sink.j;
  sinkK = place->sink.k;
  const CNhdSourceSinkObjectKvs& flow = model_->root.nhdSourceSink->at(index);
  dataFormat = flow.dataFormat;
  magnitude = flow.constantMagnitude;
  velocity = flow.constantVelocity;
  outletDirection = flow.outletDirection;
  const std::vector<std::uint32_t>& items = flow.dataFile.items;
  if (items.size() != 2 && items.size() != 3) return;
  item1 = static_cast<int>(items[0]);
  item2 = static_cast<int>(items[1]);
  if (items.size() == 3) item3 = static_cast<int>(items[2]);
}

void FloodModel::setEddyViscosity_IncludedWithDefaultValue() {
  const auto guard = model_->lock();
  constexpr double kShareOfCell = 0.02;
  const CBathymetryObjectKvs* area = model_->root.bathymetry->GetItem(1);
  const bool hasGrid = area != nullptr && !area->fileName.empty();
  const double dx = hasGrid ? double{area->dx} : 1.0;
  const double dy = hasGrid ? double{area->dy} : 1.0;
  const double timeStep = model_->root.simulationPeriod->timeStepInterval;
  setEddyViscosity_Value(kShareOfCell * dx * dy / timeStep, CNhdEddyViscosityKvs::kFluxBased);
}

void FloodModel::setEddyViscosity_NotIncluded() {
  const auto guard = model_->lock();
  model_->root.nhdEddyViscosity->dataFormat = CNhdEddyViscosityKvs::kNone;
}

void FloodModel::setEddyViscosity_Value(double value, int formulation) {
  const auto guard = model_->lock();
  CNhdEddyViscosityKvs& viscosity = *model_->root.nhdEddyViscosity;
  viscosity.dataFormat = CNhdEddyViscosityKvs::kConstant;
  viscosity.formulation = formulation;
  onlyEntry(viscosity).constantValue = static_cast<float>(value);
}

void FloodModel::setRain_Value(double value) {
  const auto guard = model_->lock();
  CNhdSourceSinkKvs& flows = *model_->root.nhdSourceSink;
  flows.netPrecipitation = false;
  flows.rainOnDryLand = true;
  flows.precipitationKind = CNhdSourceSinkKvs::kConstant;
  flows.precipitation = static_cast<float>(value);
}

void FloodModel::setRain_File(std::string fileName, int precipitationType, int item) {
  const auto guard = model_->lock();
  CNhdSourceSinkKvs& flows = *model_->root.nhdSourceSink;
  flows.netPrecipitation = true;
  flows.rainOnDryLand = true;
  flows.precipitationKind = precipitationType;
  model_->setSelection(flows.precipitationFile, fileName, item);
}

void FloodModel::setOutput_MaximumFloodDepthAndExtend(std::string fileName, int storeStep) {
  const auto guard = model_->lock();
  CNhdResultKvs& results = *model_->root.nhdResult;
  results.includeInundationStatistics = true;
  model_->setFileName(results.inundationFile, fileName);
  results.inundationStoreStep = storeStep;
}

void FloodModel::AddOutput_MapsAndTimeSeriesJK(int type, int useSubArea, int firstJ, int firstK, int lastJ,
                                               int lastK, std::vector<double> pointsJ,
                                               std::vector<double> pointsK, int usePeriod, DateTime firstDate,
                                               DateTime lastDate, int timeStepFrequency, std::string fileName,
                                               std::string title, std::vector<int> items) {
  const auto guard = model_->lock();
  appendOutput(*model_, {type, useSubArea, firstJ, firstK, lastJ, lastK, std::move(pointsJ),
                         std::move(pointsK), usePeriod, firstDate, lastDate, timeStepFrequency,
                         std::move(fileName), std::move(title), std::move(items)});
  tellUnsupported(*model_, type);
}

OutputPosition FloodModel::GetOutputsListHeadPos() {
  const auto guard = model_->lock();
  return {model_->root.nhdResult->outputs.GetCount() > 0 ? 1 : 0};
}

void FloodModel::GetNextOutputs_MapsJKAndTS(OutputPosition& position, int& type, int& useSubArea, int& firstJ,
                                            int& firstK, int& lastJ, int& lastK, std::vector<double>& pointsJ,
                                            std::vector<double>& pointsK, int& usePeriod, DateTime& firstDate,
                                            DateTime& lastDate, int& timeStepFrequency, std::string& fileName,
                                            std::string& title, std::vector<int>& items) {
  const auto guard = model_->lock();
  auto outputs = std::tie(type, useSubArea, firstJ, firstK, lastJ, lastK, pointsJ, pointsK, usePeriod,
                          firstDate, lastDate, timeStepFrequency, fileName, title, items);
  FloodOutput output;
  output.fields() = outputs;
  const int found = readOutput(*model_, position, output);
  outputs = output.fields();
  tellUnsupported(*model_, found);
}

void FloodModel::ClearHDResultOutputs() {
  const auto guard = model_->lock();
  model_->root.nhdResult->outputs.SetCount(0);
}

}  // namespace gridbay::scripting
