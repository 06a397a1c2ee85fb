#include "ecology/source_sink_page.h"

#include "ecology/source_sink.h"

namespace gridbay {

CWQSADSourceSinkDlg::CWQSADSourceSinkDlg(CVdDoc& document) : SourceValuesDlg(document) {}
CWQSADSourceSinkDlg::~CWQSADSourceSinkDlg() = default;

}  // namespace gridbay
