#include "gridbay_setup/climate_change.h"

#include "advection_dispersion/component.h"
#include "advection_dispersion/heat_exchange.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "platform/cartography/cartography.h"
#include "scripting/scripted_model.h"

namespace gridbay::scripting {
namespace {

enum class Kind { none, constant, series, grid };

// What drives the model everywhere alike: one value or one file.
struct Forcing {
  Kind kind;
  float& value;
  UTsbSelection& file;
  bool zeroIsThere = false;

  bool is(Kind wanted) const {
    return kind == wanted && (kind != Kind::constant || zeroIsThere || value > 0);
  }
};

Kind kindOf(std::int32_t stored) {
  switch (stored) {
    case CNhdSourceSinkKvs::kConstant:
      return Kind::constant;
    case CNhdSourceSinkKvs::kTimeSeries:
      return Kind::series;
    case CNhdSourceSinkKvs::kMap:
      return Kind::grid;
    default:
      return Kind::none;
  }
}

Forcing precipitationOf(ScriptedModel& model) {
  CNhdSourceSinkKvs& flows = *model.root.nhdSourceSink;
  return {kindOf(flows.precipitationKind), flows.precipitation, flows.precipitationFile};
}

Forcing evaporationOf(ScriptedModel& model) {
  CNhdSourceSinkKvs& flows = *model.root.nhdSourceSink;
  return {kindOf(flows.evaporationKind), flows.evaporation, flows.evaporationFile};
}

bool hasTemperature(ScriptedModel& model) {
  return model.root.nadComponent->CountOfType(CNadComponentObjectKvs::kHeatExchange) == 1;
}

Forcing temperatureOf(ScriptedModel& model) {
  CNadHeatExchangeKvs& heat = *model.root.nadHeatExchange;
  Kind kind = Kind::none;
  if (hasTemperature(model)) {
    if (heat.airFormat == CNadHeatExchangeKvs::kConstant) kind = Kind::constant;
    if (heat.airFormat == CNadHeatExchangeKvs::kType0File) kind = Kind::series;
    if (heat.airFormat == CNadHeatExchangeKvs::kType2File) kind = Kind::grid;
  }
  return {kind, heat.airTemperature, heat.airFile, true};
}

using ForcingOf = Forcing(ScriptedModel&);

int countOf(ScriptedModel& model, ForcingOf forcingOf, Kind kind) {
  const auto guard = model.lock();
  return forcingOf(model).is(kind) ? 1 : 0;
}

int getValue(ScriptedModel& model, ForcingOf forcingOf, int index, double& value) {
  const auto guard = model.lock();
  const Forcing forcing = forcingOf(model);
  if (index != 1 || !forcing.is(Kind::constant)) return 0;
  value = forcing.value;
  return 1;
}

int setValue(ScriptedModel& model, ForcingOf forcingOf, int index, double value) {
  const auto guard = model.lock();
  const Forcing forcing = forcingOf(model);
  if (index != 1 || !forcing.is(Kind::constant)) return 0;
  forcing.value = static_cast<float>(value);
  return 1;
}

int getFile(ScriptedModel& model, ForcingOf forcingOf, Kind kind, int index, std::string& fileName,
            int& item) {
  const auto guard = model.lock();
  const Forcing forcing = forcingOf(model);
  if (index != 1 || !forcing.is(kind)) return 0;
  fileName = forcing.file.fileName.text();
  item = 1;
  return 1;
}

int setFile(ScriptedModel& model, ForcingOf forcingOf, Kind kind, int index, const std::string& fileName) {
  const auto guard = model.lock();
  const Forcing forcing = forcingOf(model);
  if (index != 1 || !forcing.is(kind)) return 0;
  model.setFileName(forcing.file.fileName, fileName);
  forcing.file.SetNoItems(1);
  return 1;
}

constexpr int kLevelValues = 1;
constexpr int kLevelTimeSeries = 2;
constexpr int kLevelLineSeries = 3;

bool isLevelOfKind(const CNhdBoundaryObjectKvs& condition, int kind) {
  if (condition.formulation != CNhdBoundaryObjectKvs::kLevel) return false;
  switch (condition.dataFormat) {
    case CNhdBoundaryObjectKvs::kConstant:
    case CNhdBoundaryObjectKvs::kSineSeries:
      return kind == kLevelValues;
    case CNhdBoundaryObjectKvs::kType0File:
      return kind == kLevelTimeSeries;
    case CNhdBoundaryObjectKvs::kType1File:
      return kind == kLevelLineSeries;
    default:
      return false;
  }
}

// The index-th (from 1) level boundary of a kind; its number in the list too, where that is asked for.
CNhdBoundaryObjectKvs* levelBoundary(ScriptedModel& model, int kind, int index, int* number = nullptr) {
  CNhdBoundaryKvs& conditions = *model.root.nhdBoundary;
  int found = 0;
  for (int place = 1; place <= conditions.GetCount(); ++place) {
    CNhdBoundaryObjectKvs* condition = conditions.GetItem(place);
    if (!isLevelOfKind(*condition, kind) || ++found != index) continue;
    if (number != nullptr) *number = place;
    return condition;
  }
  return nullptr;
}

float& levelOf(CNhdBoundaryObjectKvs& condition) {
  const bool isSine = condition.dataFormat == CNhdBoundaryObjectKvs::kSineSeries;
  return isSine ? condition.referenceLevel : condition.value;
}

int getLevelFile(ScriptedModel& model, int kind, int index, std::string& fileName, int& item) {
  const auto guard = model.lock();
  const CNhdBoundaryObjectKvs* condition = levelBoundary(model, kind, index);
  if (condition == nullptr || condition->dataFile.items.empty()) return 0;
  fileName = condition->dataFile.fileName.text();
  item = static_cast<int>(condition->dataFile.items.front());
  return 1;
}

int setLevelFile(ScriptedModel& model, int kind, int index, const std::string& fileName, int item) {
  const auto guard = model.lock();
  CNhdBoundaryObjectKvs* condition = levelBoundary(model, kind, index);
  if (condition == nullptr) return 0;
  model.setSelection(condition->dataFile, fileName, item);
  return 1;
}

}  // namespace

CClimateChange_V27::CClimateChange_V27() : model_(std::make_shared<ScriptedModel>(false)) {}
CClimateChange_V27::~CClimateChange_V27() = default;

void ShowMessagesWith(CClimateChange_V27& model, MessageBox show) {
  const auto guard = model.model_->lock();
  model.model_->setMessageBox(std::move(show));
}

int CClimateChange_V27::OpenFile(std::string fileName) {
  const auto guard = model_->lock();
  return model_->load(fileName).isRead ? 1 : 0;
}

int CClimateChange_V27::SaveFile(std::string fileName) {
  const auto guard = model_->lock();
  static_cast<void>(model_->write(fileName));
  return 1;
}

int CClimateChange_V27::GetSimulationPeriod(DateTime& start, DateTime& end) {
  const auto guard = model_->lock();
  const auto units = ScriptedModel::lockDataFiles();
  const CSimulationPeriodKvs& period = *model_->root.simulationPeriod;
  start = scriptTime(period.start);
  end = {period.End().day, 0};
  return 0;
}

int CClimateChange_V27::GetLongLat(double& longitude, double& latitude) {
  const auto guard = model_->lock();
  const auto dataFiles = ScriptedModel::lockDataFiles();
  std::string projection;
  double east = 0;
  double north = 0;
  longitude = 0;
  latitude = 0;
  model_->root.bathymetry->GetGeoReference(&projection, &east, &north);
  if (CVdMapProjection::IsLocal(projection)) return 0;
  return CVdCartography(projection, 0, 0, 0).Proj2Geo(east, north, &longitude, &latitude) ? 1 : 0;
}

int CClimateChange_V27::ResultOutputsHasAbsolutePath() {
  const auto guard = model_->lock();
  const auto& outputs = model_->root.nhdResult->outputs;
  for (int number = 1; number <= outputs.GetCount(); ++number) {
    if (outputs.GetItem(number)->file.text().find_first_of("/\\") != std::string::npos) return 1;
  }
  return 0;
}

int CClimateChange_V27::GetNoPrecValues() {
  return countOf(*model_, precipitationOf, Kind::constant);
}
int CClimateChange_V27::GetPrecValues(int index, double& value) {
  return getValue(*model_, precipitationOf, index, value);
}
int CClimateChange_V27::SetPrecValues(int index, double value) {
  return setValue(*model_, precipitationOf, index, value);
}
int CClimateChange_V27::GetNoPrecTimeSeries() {
  return countOf(*model_, precipitationOf, Kind::series);
}
int CClimateChange_V27::GetPrecFileItem(int index, std::string& fileName, int& item) {
  return getFile(*model_, precipitationOf, Kind::series, index, fileName, item);
}
int CClimateChange_V27::SetPrecFile(int index, std::string fileName) {
  return setFile(*model_, precipitationOf, Kind::series, index, fileName);
}
int CClimateChange_V27::GetNoPrecGridSeries() {
  return countOf(*model_, precipitationOf, Kind::grid);
}
int CClimateChange_V27::GetPrecGridFileItem(int index, std::string& fileName, int& item) {
  return getFile(*model_, precipitationOf, Kind::grid, index, fileName, item);
}
int CClimateChange_V27::SetPrecGridFile(int index, std::string fileName) {
  return setFile(*model_, precipitationOf, Kind::grid, index, fileName);
}

int CClimateChange_V27::GetNoEvapValues() {
  return countOf(*model_, evaporationOf, Kind::constant);
}
int CClimateChange_V27::GetEvapValues(int index, double& value) {
  return getValue(*model_, evaporationOf, index, value);
}
int CClimateChange_V27::SetEvapValues(int index, double value) {
  return setValue(*model_, evaporationOf, index, value);
}
int CClimateChange_V27::GetNoEvapTimeSeries() {
  return countOf(*model_, evaporationOf, Kind::series);
}
int CClimateChange_V27::GetEvapFileItem(int index, std::string& fileName, int& item) {
  return getFile(*model_, evaporationOf, Kind::series, index, fileName, item);
}
int CClimateChange_V27::SetEvapFile(int index, std::string fileName) {
  return setFile(*model_, evaporationOf, Kind::series, index, fileName);
}
int CClimateChange_V27::GetNoEvapGridSeries() {
  return countOf(*model_, evaporationOf, Kind::grid);
}
int CClimateChange_V27::GetEvapGridFileItem(int index, std::string& fileName, int& item) {
  return getFile(*model_, evaporationOf, Kind::grid, index, fileName, item);
}
int CClimateChange_V27::SetEvapGridFile(int index, std::string fileName) {
  return setFile(*model_, evaporationOf, Kind::grid, index, fileName);
}

int CClimateChange_V27::GetNoTempValues() {
  return countOf(*model_, temperatureOf, Kind::constant);
}
int CClimateChange_V27::GetTempValues(int index, double& value) {
  return getValue(*model_, temperatureOf, index, value);
}
int CClimateChange_V27::SetTempValues(int index, double value) {
  const auto guard = model_->lock();
  setValue(*model_, temperatureOf, index, value);
  return hasTemperature(*model_) ? 1 : 0;
}
int CClimateChange_V27::GetNoTempTimeSeries() {
  return countOf(*model_, temperatureOf, Kind::series);
}
int CClimateChange_V27::GetTempFileItem(int index, std::string& fileName, int& item) {
  return getFile(*model_, temperatureOf, Kind::series, index, fileName, item);
}
int CClimateChange_V27::SetTempFile(int index, std::string fileName) {
  return setFile(*model_, temperatureOf, Kind::series, index, fileName);
}
int CClimateChange_V27::GetNoTempGridSeries() {
  return countOf(*model_, temperatureOf, Kind::grid);
}
int CClimateChange_V27::GetTempGridFileItem(int index, std::string& fileName, int& item) {
  return getFile(*model_, temperatureOf, Kind::grid, index, fileName, item);
}
int CClimateChange_V27::SetTempGridFile(int index, std::string fileName) {
  return setFile(*model_, temperatureOf, Kind::grid, index, fileName);
}

int CClimateChange_V27::GetNoWaterlevel(int kind) {
  const auto guard = model_->lock();
  CNhdBoundaryKvs& conditions = *model_->root.nhdBoundary;
  int found = 0;
  for (int place = 1; place <= conditions.GetCount(); ++place)
    found += isLevelOfKind(conditions.at(place), kind) ? 1 : 0;
  return found;
}

int CClimateChange_V27::GetWaterLevelBoundaryObject(int kind, int index, int& boundaryNumber) {
  const auto guard = model_->lock();
  return levelBoundary(*model_, kind, index, &boundaryNumber) != nullptr ? 1 : 0;
}

int CClimateChange_V27::GetWaterLevel(int kind, int index, int& boundaryNumber, std::string& location) {
  const auto guard = model_->lock();
  if (GetWaterLevelBoundaryObject(kind, index, boundaryNumber) == 0) return 0;
  location = model_->root.boundary->at(boundaryNumber).Text();
  return 1;
}

int CClimateChange_V27::GetNoWLValue() {
  return GetNoWaterlevel(kLevelValues);
}
int CClimateChange_V27::GetNoWLTimeSeries() {
  return GetNoWaterlevel(kLevelTimeSeries);
}
int CClimateChange_V27::GetNoWLLineSeries() {
  return GetNoWaterlevel(kLevelLineSeries);
}
int CClimateChange_V27::GetWLvalueIDLocation(int index, int& boundaryNumber, std::string& location) {
  return GetWaterLevel(kLevelValues, index, boundaryNumber, location);
}
int CClimateChange_V27::GetWLTSIDLocation(int index, int& boundaryNumber, std::string& location) {
  return GetWaterLevel(kLevelTimeSeries, index, boundaryNumber, location);
}
int CClimateChange_V27::GetWLLineIDLocation(int index, int& boundaryNumber, std::string& location) {
  return GetWaterLevel(kLevelLineSeries, index, boundaryNumber, location);
}

int CClimateChange_V27::GetWLValue(int index, double& value) {
  const auto guard = model_->lock();
  CNhdBoundaryObjectKvs* condition = levelBoundary(*model_, kLevelValues, index);
  if (condition == nullptr) return 0;
  value = levelOf(*condition);
  return 1;
}

int CClimateChange_V27::SetWLValue(int index, double value) {
  const auto guard = model_->lock();
  CNhdBoundaryObjectKvs* condition = levelBoundary(*model_, kLevelValues, index);
  if (condition == nullptr) return 0;
  levelOf(*condition) = static_cast<float>(value);
  return 1;
}

int CClimateChange_V27::GetWLFileItem(int index, std::string& fileName, int& item) {
  return getLevelFile(*model_, kLevelTimeSeries, index, fileName, item);
}
int CClimateChange_V27::SetWLFile(int index, std::string fileName) {
  return setLevelFile(*model_, kLevelTimeSeries, index, fileName, 1);
}
int CClimateChange_V27::GetWLLineFileItem(int index, std::string& fileName, int& item) {
  return getLevelFile(*model_, kLevelLineSeries, index, fileName, item);
}
int CClimateChange_V27::SetWLLineFile(int index, std::string fileName, int item) {
  return item < 1 ? 0 : setLevelFile(*model_, kLevelLineSeries, index, fileName, item);
}

}  // namespace gridbay::scripting
