#include "hydrodynamic/boundary.h"

#include <algorithm>
#include <filesystem>

#include "basic/basic_parts.h"
#include "basic/boundary.h"
#include "core/name_bytes.h"
#include "families/data_files.h"
#include "platform/files/paths.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr std::int32_t kStoredFabChoice = 3;
constexpr std::int32_t kFabTransfer = 2;
constexpr std::int32_t kFabDefault = 12;
constexpr int kTransferDataType = 1;
constexpr int kRatingCurveAxis = 2;

// The quantities that a data file may have.
std::vector<int> itemTypes(std::int32_t formulation, std::int32_t dataFormat) {
  const bool isFlux = formulation == CNhdBoundaryObjectKvs::kFlux;
  if (!isFlux || dataFormat == CNhdBoundaryObjectKvs::kTransferFile)
    return {item::kWaterLevel, item::kSurfaceElevation};
  if (dataFormat == CNhdBoundaryObjectKvs::kType1File) return {item::kFlowFlux};
  return {item::kDischarge, item::kFlowRate};
}

bool isWithin(std::int32_t value, std::int32_t end, std::int32_t otherEnd) {
  const auto [least, greatest] = std::minmax(end, otherEnd);
  return least <= value && value <= greatest;
}

bool isOnLine(std::int32_t point, const CBoundaryObjectKvs& line) {
  if (line.first.j == line.last.j) return isWithin(point, line.first.k, line.last.k);
  if (line.first.k == line.last.k) return isWithin(point, line.first.j, line.last.j);
  return point == 0;
}

bool isRatingCurve(const FileNameValue& file) {
  return !file.empty() && names::same(std::filesystem::path(file.text()).extension().string(), ".tsb0") &&
         isReadableFile(file.absolute());
}

}  // namespace

void CNhdBoundaryObjectKvs::FabTypeRow::save(const CNhdBoundaryObjectKvs& object, KvsFile& file,
                                             const std::string&) const {
  kvsPutParam(file, name, object.fabType == kStoredFabChoice ? kFabDefault : object.fabType);
}

void CNhdBoundaryObjectKvs::FabTypeRow::load(CNhdBoundaryObjectKvs& object, KvsSection from,
                                             const std::string&) const {
  kvsGetParam(from, name, &object.fabType, 1, 1);
}

void CNhdBoundaryObjectKvs::copyWhole(const CNhdBoundaryObjectKvs& other) {
  CopyFrom(other);
  referenceLevel = other.referenceLevel;
  range = other.range;
  period = other.period;
  phase = other.phase;
  relaxationFactor = other.relaxationFactor;
}

void CNhdBoundaryObjectKvs::SetDataFormat(std::int32_t format) {
  if (format == dataFormat) return;
  dataFormat = format;
  switch (format) {
    case kConstant:
    case kSineSeries:
      fabType = kFabDefault;
      break;
    case kType0File:
    case kType1File:
      dataFile.SetNoItems(1);
      fabType = kFabDefault;
      break;
    case kTransferFile:
      dataFile.SetNoItems(0);
      fabType = kFabTransfer;
      break;
    case kRatingCurve:
      dataFile.SetNoItems(1);
      break;
    default:
      break;
  }
}

int CNhdBoundaryObjectKvs::quantity() const {
  return formulation == kFlux ? item::kDischarge : item::kWaterLevel;
}

int CNhdBoundaryObjectKvs::dataQuantity() const {
  if (formulation != kFlux) return dataFormat == kTransferFile ? item::kFlowFlux : item::kWaterLevel;
  if (dataFormat <= kType0File) return item::kDischarge;
  return dataFormat == kRatingCurve ? item::kUndefined : item::kFlowFlux;
}

CBoundaryObjectKvs* CNhdBoundaryObjectKvs::boundary(int number) {
  auto* basic = parts<BasicParts>();
  return basic == nullptr ? nullptr : basic->boundary->GetItem(number);
}

void CNhdBoundaryObjectKvs::finishRequest(CVdFileSelectorDlg& selector) {
  requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

void CNhdBoundaryObjectKvs::RequestDataFile(CVdFileSelectorDlg& selector, int number) {
  if (dataFormat < kType0File || dataFormat > kRatingCurve ||
      (dataFormat > kTransferFile && dataFormat < kRatingCurve))
    return;
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(texts::boundaryRequest.format);
  request.SetMultiQunType(itemTypes(formulation, dataFormat));
  switch (dataFormat) {
    case kType0File:
      request.SetDimensions(0);
      break;
    case kType1File:
      requestAlongBoundary(request, boundary(number), pointsAlong);
      break;
    case kTransferFile:
      requestAlongBoundary(request, boundary(number), pointsAlong);
      selector.SetDataType(kTransferDataType);
      break;
    default:
      selector.SetTimeAxisType(kRatingCurveAxis);
      selector.SetTimeAxisQunUnitEquivalentWith(unit::kMetre);
      request.SetDimensions(0);
      break;
  }
  finishRequest(selector);
}

void CNhdBoundaryObjectKvs::RequestDirectionFile(CVdFileSelectorDlg& selector, int number) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(texts::flowDirectionRequest.format);
  request.SetQunType(item::kFlowDirection, 0);
  requestAlongBoundary(request, boundary(number), pointsAlong);
  finishRequest(selector);
}

unsigned CNhdBoundaryObjectKvs::Validate(ValidationList& messages, int, int number) {
  unsigned faults = 0;
  CVdFileSelectorDlg selector;
  RequestDataFile(selector, number);
  if (dataFormat == kType0File || dataFormat == kType1File) {
    faults += checkDataFile(messages, PageId::hdBoundary, selector, dataFile, Reason::told);
  } else if (dataFormat == kTransferFile) {
    faults += checkDataFile(messages, PageId::hdBoundary, selector, dataFile.fileName, Reason::told);
  } else if (dataFormat == kRatingCurve && !isRatingCurve(dataFile.fileName)) {
    std::string why;
    selector.IsTsbFileValid(dataFile.fileName.absolute(), dataFile.items, &why);
    faults += reportDataFile(messages, PageId::hdBoundary, dataFile.fileName, why);
  }
  if (tiltType == 0 || tiltType == 1) {
    const CBoundaryObjectKvs* line = boundary(number);
    if (line == nullptr) {
      faults += report(messages, PageId::hdBoundary, Severity::fault, texts::noBoundaryDataItem);
    } else if (!isOnLine(tiltingPoint, *line)) {
      faults += report(messages, PageId::hdBoundary, Severity::fault, texts::tiltingPointOutside);
    }
  }
  if ((fabType == kFabTransfer || fabType == kFabDefault) && enableUserDirections) {
    CVdFileSelectorDlg directions;
    RequestDirectionFile(directions, number);
    faults += checkDataFile(messages, PageId::hdBoundary, directions, directionFile);
  }
  return faults;
}

}  // namespace gridbay
