#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/result.h"
#include "families/transport_results_page.h"

namespace gridbay {

using CNadResultGrid = TransportOutputGrid<&AdvectionDispersionParts::nadResult>;
using CNadResultHotStartGrid = ResultHotStartGrid<&AdvectionDispersionParts::nadResult>;

// The outputs and hot start files of the module.
class CNadResultDlg final : public Page<18735, PageId::adResult> {
  using Page::Page;
  void DoDataExchange(Form& form) override {
    const auto results = objectOf(&AdvectionDispersionParts::nadResult);
    listOutputControls(form, results, "Size of AD output", outputs_);
    listHotStartControls(form, results, "Generate Hot Start", hotStarts_);
  }

  CNadResultGrid outputs_;
  CNadResultHotStartGrid hotStarts_;
};

}  // namespace gridbay
