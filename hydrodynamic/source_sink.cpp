#include "hydrodynamic/source_sink.h"

#include "basic/basic_parts.h"
#include "basic/source_sink.h"
#include "families/data_files.h"
#include "platform/units/units.h"

namespace gridbay {

int CNhdSourceSinkObjectKvs::NoItems(int number) {
  auto* basic = parts<BasicParts>();
  const CSourceSinkObjectKvs* location = basic == nullptr ? nullptr : basic->sourceSink->GetItem(number);
  return location != nullptr && location->type == CSourceSinkObjectKvs::kIsolatedSink ? 1 : 2;
}

void CNhdSourceSinkObjectKvs::RequestDataFile(CVdFileSelectorDlg& selector, int number) {
  const int noItems = NoItems(number);
  UTsbSelection wanted = dataFile;
  wanted.SetNoItems(noItems);
  selector.SetSelectedItems(wanted.items);
  selector.SetMinNoItems(noItems);
  CVdRqTsbItem& magnitude = selector.AddRequest();
  magnitude.SetDimensions(0);
  magnitude.SetSelectionDescr(texts::magnitudeRequest.format);
  magnitude.SetMultiQunType({item::kDischarge, item::kFlowRate});
  if (noItems > 1) {
    CVdRqTsbItem& velocity = selector.AddRequest();
    velocity.SetDimensions(0);
    velocity.SetSelectionDescr(texts::velocityRequest.format);
    velocity.SetMultiQunType({item::kFlowVelocity, item::kCurrentSpeed});
  }
  requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

unsigned CNhdSourceSinkObjectKvs::Validate(ValidationList& messages, int, int number) {
  if (dataFormat != kFromFile) return 0;
  CVdFileSelectorDlg selector;
  RequestDataFile(selector, number);
  dataFile.items = selector.GetSelectedItems();
  return checkDataFile(messages, PageId::hdSourceAndSink, selector, dataFile);
}

void CNhdSourceSinkKvs::requestKind(CVdFileSelectorDlg& selector, CVdRqTsbItem& request, std::int32_t kind) {
  if (kind == kMap) {
    requestArea(request, *this, 1);
  } else {
    request.SetDimensions(0);
  }
  selector.SetNoItems(1);
  requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

void CNhdSourceSinkKvs::RequestEvaporation(CVdFileSelectorDlg& selector) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetQunType(item::kEvaporationRate);
  requestKind(selector, request, evaporationKind);
}

void CNhdSourceSinkKvs::RequestPrecipitation(CVdFileSelectorDlg& selector) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(texts::rainfallRequest.format);
  request.SetMultiQunType({item::kRainAndEvaporation, item::kRainfallRate, item::kPrecipitationRate});
  requestKind(selector, request, precipitationKind);
}

unsigned CNhdSourceSinkKvs::Validate(ValidationList& messages, int deep) {
  unsigned faults = 0;
  if (precipitationKind != kConstant) {
    CVdFileSelectorDlg selector;
    RequestPrecipitation(selector);
    faults += checkDataFile(messages, PageId::hdSourceAndSink, selector, precipitationFile, Reason::told);
  }
  if (evaporationKind != kConstant && !netPrecipitation) {
    CVdFileSelectorDlg selector;
    RequestEvaporation(selector);
    faults += checkDataFile(messages, PageId::hdSourceAndSink, selector, evaporationFile);
  }
  return faults + ListKvs::Validate(messages, deep);
}

}  // namespace gridbay
