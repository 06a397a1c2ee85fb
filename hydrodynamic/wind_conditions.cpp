#include "hydrodynamic/wind_conditions.h"

#include "core/table_code.h"
#include "families/data_files.h"
#include "hydrodynamic/texts.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

struct WindItem {
  Text description;
  std::vector<int> types;
};

std::vector<WindItem> windItems(std::int32_t dataFormat) {
  const std::vector<int> speeds{item::kWindVelocity, item::kWindSpeed};
  if (dataFormat == CWindConditionsKvs::kConstantInSpace)
    return {{texts::windSpeedRequest, speeds}, {texts::windDirectionRequest, {item::kWindDirection}}};
  if (dataFormat != CWindConditionsKvs::kVarying) return {};
  return {{texts::airPressureRequest,
           {item::kAirPressure, item::kAtmosphericPressure, item::kBarometricPressure}},
          {texts::windXRequest, speeds},
          {texts::windYRequest, speeds}};
}

int itemCount(std::int32_t dataFormat) {
  return static_cast<int>(windItems(dataFormat).size());
}

}  // namespace

void CWindConditionsKvs::WindFileRow::load(CWindConditionsKvs& wind, KvsSection from,
                                           const std::string& documentPath) const {
  wind.windFile.Load(from, documentPath,
                     wind.hasFile() ? std::optional(itemCount(wind.dataFormat)) : std::nullopt);
}

void CWindConditionsKvs::SetDataFormat(std::int32_t format) {
  dataFormat = format;
  if (hasFile()) windFile.SetNoItems(itemCount(format));
}

void CWindConditionsKvs::RequestFile(CVdFileSelectorDlg& selector) {
  if (!hasFile()) return;
  for (const auto& [description, types] : windItems(dataFormat)) {
    CVdRqTsbItem& request = selector.AddRequest();
    request.SetSelectionDescr(description.format);
    request.SetMultiQunType(types);
  }
  requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

unsigned CWindConditionsKvs::Validate(ValidationList& messages, int) {
  unsigned faults = 0;
  if (constantSpeed < 0)
    faults += report(messages, PageId::windConditions, Severity::fault, texts::negativeWindSpeed);
  if (!hasFile()) return faults;
  CVdFileSelectorDlg selector;
  RequestFile(selector);
  return faults + checkDataFile(messages, PageId::windConditions, selector, windFile);
}

}  // namespace gridbay
