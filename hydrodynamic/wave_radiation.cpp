#include "hydrodynamic/wave_radiation.h"

#include "families/data_files.h"

namespace gridbay {
namespace {

constexpr int kRadiationDataType = 930;

}  // namespace

void CNhdWaveRadiationObjectKvs::RequestFile(CVdFileSelectorDlg& selector, int number) {
  selector.SetDataType(kRadiationDataType);
  requestArea(selector, *this, number);
  if (timeDescription == kQuasiStationary) requestSimulationPeriod(selector, *this);
  requestForEngine(selector);
}

unsigned CNhdWaveRadiationObjectKvs::Validate(ValidationList& messages, int, int number) {
  if (included == 0) return 0;
  CVdFileSelectorDlg selector;
  RequestFile(selector, number);
  return checkDataFile(messages, PageId::waveRadiation, selector, fileName);
}

}  // namespace gridbay
