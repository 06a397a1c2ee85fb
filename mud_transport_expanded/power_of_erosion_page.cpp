#include "mud_transport_expanded/power_of_erosion_page.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/power_of_erosion.h"

namespace gridbay {

void CNmtExpPowerOfErosionGrid::LayOut() {
  const auto layer = RowsOf(&MudTransportExpandedParts::nmtExpPowerOfErosion);
  Number("Power", 80, layer, &CNmtExpPowerOfErosionObjectKvs::power);
}

void CNmtExpPowerOfErosionDlg::DoDataExchange(Form& form) {
  form.Grid("Power of erosion", grid_);
}

}  // namespace gridbay
