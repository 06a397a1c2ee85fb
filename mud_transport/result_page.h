#pragma once

#include "families/transport_results_page.h"
#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/result.h"

namespace gridbay {

using CNmtResultGrid = TransportOutputGrid<&MudTransportParts::nmtResult>;
using CNmtResultHotStartGrid = ResultHotStartGrid<&MudTransportParts::nmtResult>;

// The outputs and hot start files of the module.
class CNmtResultDlg final : public Page<18830, PageId::mtResult> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtResultGrid outputs_;
  CNmtResultHotStartGrid hotStarts_;
};

}  // namespace gridbay
