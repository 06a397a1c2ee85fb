#include "advection_dispersion/deposition_concentration_page.h"

namespace gridbay {

FileKind CNadSurfaceDepositionGrid::KindOfFile(std::int32_t format) {
  return isMap(format) ? texts::surfaceDepositionMapFile : texts::surfaceDepositionSeriesFile;
}

FileKind CNadSoilDepositionGrid::KindOfFile(std::int32_t format) {
  return isMap(format) ? texts::soilDepositionMapFile : texts::soilDepositionSeriesFile;
}

CNadDepositionConcentrationDlg::CNadDepositionConcentrationDlg(CVdDoc& document) : DepositionDlg(document) {}
CNadDepositionConcentrationDlg::~CNadDepositionConcentrationDlg() = default;

}  // namespace gridbay
