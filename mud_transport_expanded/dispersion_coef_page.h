#pragma once

#include "families/dispersion_page.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"

namespace gridbay {

// A row for each area.
using CNmtExpDispersionCoefGrid = DispersionCoefGrid<&MudTransportExpandedParts::nmtExpDispersionCoef>;

// The dispersion of all that is carried.
class CNmtExpDispersionCoefDlg final
    : public DispersionCoefDlg<18845, PageId::mtExpDispersionCoef,
                               &MudTransportExpandedParts::nmtExpDispersionCoef> {
 public:
  explicit CNmtExpDispersionCoefDlg(CVdDoc& document);
  ~CNmtExpDispersionCoefDlg() override;
};

}  // namespace gridbay
