#include "mud_transport_expanded/sources_page.h"

#include "mud_transport_expanded/sources.h"

namespace gridbay {

CNmtExpSourcesDlg::CNmtExpSourcesDlg(CVdDoc& document) : SourceValuesDlg(document) {}
CNmtExpSourcesDlg::~CNmtExpSourcesDlg() = default;

}  // namespace gridbay
