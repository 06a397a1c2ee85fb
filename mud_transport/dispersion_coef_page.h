#pragma once

#include "families/dispersion_page.h"
#include "mud_transport/mud_transport_parts.h"

namespace gridbay {

// A row for each area.
using CNmtDispersionCoefGrid = DispersionCoefGrid<&MudTransportParts::nmtDispersionCoef>;

// The dispersion of all fractions.
class CNmtDispersionCoefDlg final
    : public DispersionCoefDlg<18814, PageId::mtDispersionCoef, &MudTransportParts::nmtDispersionCoef> {
 public:
  explicit CNmtDispersionCoefDlg(CVdDoc& document);
  ~CNmtDispersionCoefDlg() override;
};

}  // namespace gridbay
