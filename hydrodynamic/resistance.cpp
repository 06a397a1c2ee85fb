#include "hydrodynamic/resistance.h"

#include <algorithm>
#include <limits>

#include "basic/simulation_period.h"
#include "core/table_code.h"
#include "families/data_files.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr int kPierDataType = 800;
constexpr int kOuterArea = 1;

unsigned checkFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                   const UTsbSelection& file) {
  noteDataFile(messages, page, selector, file.fileName, file.items);
  std::string why;
  if (selector.IsTsbFileValid(file.fileName.absolute(), file.items, &why)) return 0;
  return report(messages, page, Severity::fault, texts::waveOrGrainFileNotValid, file.fileName.text());
}

}  // namespace

void CNhdResistanceObjectKvs::CopyFrom(const CKvsBase& other) {
  const auto& source = static_cast<const CNhdResistanceObjectKvs&>(other);
  copyWhole(source);
  TakeParent(source);
  pierFile.UpdateData(source.map);
}

void CNhdResistanceObjectKvs::RequestMap(CVdFileSelectorDlg& selector, int number) {
  const auto* list = dynamic_cast<const CNhdResistanceKvs*>(GetParent());
  const bool isManning = list == nullptr || list->formulation == CNhdResistanceKvs::kManning;
  requestMap(selector, *this, number, texts::resistanceRequest,
             {isManning ? item::kManningNumber : item::kChezyNumber});
}

void CNhdResistanceObjectKvs::RequestPierFile(CVdFileSelectorDlg& selector, int) {
  selector.SetDataType(kPierDataType);
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(texts::pierResistanceRequest.format);
  request.SetDimensions(1);
  requestForEngine(selector);
}

unsigned CNhdResistanceObjectKvs::Validate(ValidationList& messages, int, int number) {
  unsigned faults = 0;
  if (dataFormat == kConstant && constantValue < 0)
    faults += report(messages, PageId::resistance, Severity::fault, texts::negativeResistance);
  if (dataFormat == kDataFile) {
    CVdFileSelectorDlg selector;
    RequestMap(selector, number);
    faults += checkDataFile(messages, PageId::resistance, selector, map);
  }
  if (includePier) {
    CVdFileSelectorDlg selector;
    RequestPierFile(selector, number);
    faults += checkDataFile(messages, PageId::resistance, selector, pierFile);
  }
  return faults;
}

void CNhdResistanceKvs::GrainFormatRow::save(const CNhdResistanceKvs& resistance, KvsFile& file,
                                             const std::string&) const {
  constexpr std::int32_t kMost = std::numeric_limits<std::int32_t>::max() - 1;
  const std::int32_t format = resistance.diameterFormat;
  kvsPutParam(file, name, format == 0 ? 0 : std::min(format, kMost) + 1);
}

void CNhdResistanceKvs::GrainFormatRow::load(CNhdResistanceKvs& resistance, KvsSection from,
                                             const std::string&) const {
  if (kvsKeywordByNameNum(from, name, 1) == nullptr) return;
  constexpr std::int32_t kLeast = std::numeric_limits<std::int32_t>::min() + 1;
  std::int32_t onFile = 0;
  kvsGetParam(from, name, &onFile, 1, 1);
  resistance.diameterFormat = onFile == 0 ? 0 : std::max(onFile, kLeast) - 1;
}

void CNhdResistanceKvs::RequestWaveFile(CVdFileSelectorDlg& selector) {
  if (!hasWaveFile()) return;
  const auto request = [&selector](const Text& description, std::vector<int> types) {
    CVdRqTsbItem& added = selector.AddRequest();
    added.SetSelectionDescr(description.format);
    added.SetMultiQunType(std::move(types));
  };
  selector.SetMinNoItems(3);
  request(texts::waveHeightRequest, {item::kSignificantWaveHeight, item::kWaveHeight});
  request(texts::wavePeriodRequest, {item::kWavePeriod});
  request(texts::waveDirectionRequest, {item::kMeanWaveDirection, item::kWaveDirection});
  if (waveFormat != kWaveMap) requestSimulationPeriod(selector, *this);
  if (waveFormat != kWaveSeries) requestArea(selector, *this, kOuterArea);
  requestForEngine(selector);
}

void CNhdResistanceKvs::RequestGrainSizeMap(CVdFileSelectorDlg& selector) {
  if (!hasGrainSizeMap()) return;
  requestMap(selector, *this, kOuterArea, texts::grainDiameterRequest,
             {item::kSedimentGrainDiameter, item::kGrainDiameter, item::kMedianGrainDiameter});
  if (diameterFormat == kVaryingGrain) requestSimulationPeriod(selector, *this);
}

unsigned CNhdResistanceKvs::Validate(ValidationList& messages, int deep) {
  unsigned faults = AreaListKvs::Validate(messages, deep);
  const auto fault = [&messages](const Text& text) {
    return report(messages, PageId::resistance, Severity::fault, text);
  };
  auto* basic = parts<BasicParts>();
  if (waveHeightOverDepthLimit <= 0) faults += fault(texts::waveHeightLimitNotPositive);
  if (updateFrequency < 1) faults += fault(texts::updateFrequencyNotPositive);
  if (basic != nullptr && updateFrequency > basic->simulationPeriod->noPointsInTime)
    faults += fault(texts::updateFrequencyTooHigh);
  if (formulation == kWaveInduced && hasWaveFile()) {
    CVdFileSelectorDlg selector;
    RequestWaveFile(selector);
    faults += checkFile(messages, PageId::waves, selector, waveFile);
  }
  if (hasGrainSizeMap()) {
    CVdFileSelectorDlg selector;
    RequestGrainSizeMap(selector);
    faults += checkFile(messages, PageId::resistance, selector, grainSizeMap);
  }
  return faults;
}

}  // namespace gridbay
