#pragma once

#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "pages/form_view.h"

namespace gridbay {

// What acts on the sediment beside the flow.
class CNmtExpForcingsDlg final : public Page<18849, PageId::mtExpForcings> {
  using Page::Page;
  void DoDataExchange(Form& form) override {
    const auto forcings = objectOf(&MudTransportExpandedParts::nmtExpForcings);
    form.Check("Include Waves", forcings, &CNmtExpForcingsKvs::includeWaves);
    form.Check("Include Dredging", forcings, &CNmtExpForcingsKvs::includeDredging);
  }
};

}  // namespace gridbay
