#pragma once

#include "families/transport_results_page.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/result.h"

namespace gridbay {

// The outputs, each with a dialog for its items.
class CNmtExpResultGrid final : public TransportOutputColumns {
  void LayOut() override;
  void chooseItems(int number);
};

using CNmtExpResultHotStartGrid = ResultHotStartGrid<&MudTransportExpandedParts::nmtExpResult>;

// The outputs and hot start files of the module.
class CNmtExpResultDlg final : public Page<18856, PageId::mtExpResult> {
  using Page::Page;
  void DoDataExchange(Form& form) override {
    const auto results = objectOf(&MudTransportExpandedParts::nmtExpResult);
    listOutputControls(form, results, "Size of MT output", outputs_);
    listHotStartControls(form, results, "Generate hot Start", hotStarts_);
  }

  CNmtExpResultGrid outputs_;
  CNmtExpResultHotStartGrid hotStarts_;
};

}  // namespace gridbay
