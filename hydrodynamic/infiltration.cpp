#include "hydrodynamic/infiltration.h"

#include "core/table_code.h"
#include "families/data_files.h"
#include "hydrodynamic/texts.h"
#include "platform/units/units.h"

namespace gridbay {

UTsbSelection* CNhdInfiltrationKvs::File() {
  switch (infiltrationType) {
    case kNetRate:
      return &netRateFile;
    case kCapacity:
      return &capacityFile;
    default:
      return nullptr;
  }
}

void CNhdInfiltrationKvs::FormatRow::save(const CNhdInfiltrationKvs& object, KvsFile& file,
                                          const std::string& documentPath) const {
  if (object.infiltrationType == kNetRate) Keyword::save(object, file, documentPath);
  if (object.infiltrationType == kCapacity) put(file, kConstantInTime, documentPath);
}

void CNhdInfiltrationKvs::FormatRow::load(CNhdInfiltrationKvs& object, KvsSection from,
                                          const std::string& documentPath) const {
  if (object.infiltrationType == kNetRate) Keyword::load(object, from, documentPath);
}

bool CNhdInfiltrationKvs::FormatRow::access(CNhdInfiltrationKvs& object, std::string_view path,
                                            PathAccess& access) const {
  if (!sameName(path, name)) return false;
  access.isWrittenOnly = object.infiltrationType != kNetRate;
  if (access.what == PathAccess::What::write) save(object, *access.out, *access.documentPath);
  if (access.what == PathAccess::What::set) load(object, access.in, *access.documentPath);
  return true;
}

void CNhdInfiltrationKvs::FileRow::save(const CNhdInfiltrationKvs& object, KvsFile& file,
                                        const std::string& documentPath) const {
  if (object.File() != nullptr) object.File()->Save(file, documentPath);
}

void CNhdInfiltrationKvs::FileRow::load(CNhdInfiltrationKvs& object, KvsSection from,
                                        const std::string& documentPath) const {
  if (object.infiltrationType == kNetRate) object.netRateFile.Load(from, documentPath, 1);
  if (object.infiltrationType == kCapacity) object.capacityFile.Load(from, documentPath, kCapacityItems);
}

void CNhdInfiltrationKvs::FileRow::copy(CNhdInfiltrationKvs& object, const CNhdInfiltrationKvs& other) const {
  object.netRateFile.UpdateData(other.netRateFile);
  object.capacityFile.UpdateData(other.capacityFile);
}

bool CNhdInfiltrationKvs::FileRow::access(CNhdInfiltrationKvs& object, std::string_view path,
                                          PathAccess& access) const {
  return object.File() != nullptr && object.File()->Access(path, access);
}

void CNhdInfiltrationKvs::RequestNetRate(CVdFileSelectorDlg& selector) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(texts::infiltrationRequest.format);
  if (infiltrationFormat == kVaryingInTime) {
    request.SetMultiQunType({item::kInfiltration, item::kInfiltrationCapacity, item::kNetInfiltrationRate});
    requestSimulationPeriod(selector, *this);
  } else {
    request.SetMultiQunType({item::kInfiltration, item::kInfiltrationCapacity, item::kInfiltrationRate});
  }
  requestArea(request, *this, 1);
  requestForEngine(selector);
}

void CNhdInfiltrationKvs::RequestCapacity(CVdFileSelectorDlg& selector) {
  const auto add = [&](const Text& description, std::vector<int> types) {
    CVdRqTsbItem& request = selector.AddRequest();
    request.SetSelectionDescr(description.format);
    request.SetMultiQunType(std::move(types));
    requestArea(request, *this, 1);
  };
  selector.SetMinNoItems(kCapacityItems);
  add(texts::infiltrationRequest,
      {item::kInfiltration, item::kInfiltrationCapacity, item::kInfiltrationRate});
  add(texts::porosityRequest,
      {item::kPorosity, item::kPorosityCoefficient, item::kSoilPorosity, item::kEffectivePorosity});
  if (groundwaterDepthType == kLevel) {
    add(texts::groundwaterElevationRequest, {item::kGroundElevation});
  } else {
    add(texts::depthBelowGroundRequest, {item::kDepthBelowGround});
  }
  add(texts::leakageRequest, {item::kLeakage});
  if (initialVolumeType == kWaterContent) {
    add(texts::waterContentRequest, {item::kVolumetricWaterContent});
  } else {
    add(texts::percentageRequest, {item::kPercentage, item::kSaturation});
  }
  requestForEngine(selector);
}

unsigned CNhdInfiltrationKvs::Validate(ValidationList& messages, int) {
  if (File() == nullptr) return 0;
  if (!File()->fileName.empty()) {
    CVdFileSelectorDlg selector;
    if (infiltrationType == kNetRate) RequestNetRate(selector);
    noteDataFile(messages, PageId::infiltration, selector, File()->fileName, File()->items);
    return 0;
  }
  return report(messages, PageId::infiltration, Severity::fault, texts::infiltrationFileNotValid);
}

}  // namespace gridbay
