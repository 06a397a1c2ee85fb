#include "mud_transport_expanded/deposition_page.h"

namespace gridbay {

void CNmtExpDepositionDlg::DoDataExchange(Form& form) {
  const auto deposition = objectOf(&MudTransportExpandedParts::nmtExpDeposition);
  form.Radio("Sediment profile", Choices::numbered({"Apply Rouse Profile", "Apply Teeter Profile"}),
             deposition, &CNmtExpDepositionKvs::sedimentProfile);
  form.Number("Relative centroid height", deposition, &CNmtExpDepositionKvs::centroidHeight);
  form.Grid("Critical shear stress", grid_);
}

}  // namespace gridbay
