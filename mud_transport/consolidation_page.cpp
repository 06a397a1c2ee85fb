#include "mud_transport/consolidation_page.h"

#include "mud_transport/consolidation.h"
#include "mud_transport/mud_transport_parts.h"

namespace gridbay {

void CNmtConsolidationDlg::DoDataExchange(Form& form) {
  form.Check("Include consolidation of mud within layers", objectOf(&MudTransportParts::nmtConsolidation),
             &CNmtConsolidationKvs::useConsolidation);
}

}  // namespace gridbay
