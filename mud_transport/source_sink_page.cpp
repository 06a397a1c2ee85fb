#include "mud_transport/source_sink_page.h"

#include "mud_transport/source_sink.h"

namespace gridbay {

CNmtSourceSinkDlg::CNmtSourceSinkDlg(CVdDoc& document) : SourceValuesDlg(document) {}
CNmtSourceSinkDlg::~CNmtSourceSinkDlg() = default;

}  // namespace gridbay
