#include "advection_dispersion/heat_exchange.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"
#include "core/table_code.h"
#include "families/data_files.h"
#include "platform/units/units.h"

namespace gridbay {

void CNadHeatExchangeKvs::RequestAirFile(CVdFileSelectorDlg& selector) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(texts::airTemperature.format);
  request.SetQunType(item::kTemperature);
  if (airFormat == kType0File) {
    request.SetDimensions(0);
  } else {
    requestArea(request, *this, 1);
  }
  requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

void CNadHeatExchangeKvs::RequestHumidityFile(CVdFileSelectorDlg& selector) {
  requestSeries(selector, texts::relativeHumidity);
}

void CNadHeatExchangeKvs::RequestClearnessFile(CVdFileSelectorDlg& selector) {
  requestSeries(selector, texts::clearnessCoefficient);
}

// Of any quantity: there are files with percentages, and others with shares.
void CNadHeatExchangeKvs::requestSeries(CVdFileSelectorDlg& selector, const Text& description) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(description.format);
  request.SetDimensions(0);
  requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

unsigned CNadHeatExchangeKvs::Validate(ValidationList& messages, int) {
  auto* module = parts<AdvectionDispersionParts>();
  if (module == nullptr || module->nadComponent->CountOfType(CNadComponentObjectKvs::kHeatExchange) != 1)
    return 0;
  const auto check = [&](std::int32_t format, const UTsbSelection& file,
                         void (CNadHeatExchangeKvs::*request)(CVdFileSelectorDlg&)) {
    if (format == kConstant) return 0U;
    CVdFileSelectorDlg selector;
    (this->*request)(selector);
    return checkDataFile(messages, PageId::adHeatExchange, selector, file);
  };
  unsigned faults = check(airFormat, airFile, &CNadHeatExchangeKvs::RequestAirFile);
  faults += check(clearnessFormat, clearnessFile, &CNadHeatExchangeKvs::RequestClearnessFile);
  faults += check(humidityFormat, humidityFile, &CNadHeatExchangeKvs::RequestHumidityFile);
  return faults;
}

}  // namespace gridbay
