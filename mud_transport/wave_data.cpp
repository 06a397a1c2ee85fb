#include "mud_transport/wave_data.h"

#include "core/table_code.h"
#include "families/data_files.h"
#include "mud_transport/texts.h"

namespace gridbay {

// Maps of Area 1: height, period and direction, in this order and of any quantity. Fields that are
// interpolated cover the simulation; those of a database have no time.
void CNmtWaveDataKvs::RequestDataFile(CVdFileSelectorDlg& selector) {
  for (const Text& text :
       {texts::mtWaveHeightRequest, texts::mtWavePeriodRequest, texts::mtWaveDirectionRequest}) {
    CVdRqTsbItem& request = selector.AddRequest();
    request.SetSelectionDescr(text.format);
    requestArea(request, *this, 1);
  }
  if (useDatabase == 0) {
    requestSimulationPeriod(selector, *this);
    selector.AllowOneTimeStep();
  }
  requestForEngine(selector);
}

unsigned CNmtWaveDataKvs::Validate(ValidationList& messages, int) {
  if (!IsFromFile()) return 0;
  CVdFileSelectorDlg selector;
  RequestDataFile(selector);
  return checkDataFile(messages, PageId::mtWaveData, selector, file);
}

}  // namespace gridbay
