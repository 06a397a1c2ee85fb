#include "mud_transport_expanded/transition_page.h"

namespace gridbay {

bool CNmtExpTransitionGrid::IsEnabled() {
  return parts<MudTransportExpandedParts>().nmtExpTransition->isExcluded == 0;
}

void CNmtExpTransitionDlg::DoDataExchange(Form& form) {
  form.Check("Include transition of mud between layers",
             objectOf(&MudTransportExpandedParts::nmtExpTransition), &CNmtExpTransitionKvs::isExcluded, 0, 1);
  form.Grid("Transition between layers", grid_);
}

}  // namespace gridbay
