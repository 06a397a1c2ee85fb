#include "advection_dispersion/source_sink_page.h"

#include "advection_dispersion/source_sink.h"

namespace gridbay {

CNadSourceSinkDlg::CNadSourceSinkDlg(CVdDoc& document) : SourceValuesDlg(document) {}
CNadSourceSinkDlg::~CNadSourceSinkDlg() = default;

}  // namespace gridbay
