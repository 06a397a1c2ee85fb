#include "mud_transport_expanded/settlings_page.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/settlings.h"

namespace gridbay {

using Settlings = CNmtExpSettlingsKvs;

void CNmtExpSettlingsDlg::DoDataExchange(Form& form) {
  const auto settlings = objectOf(&MudTransportExpandedParts::nmtExpSettlings);
  form.Radio("Settling velocity",
             Choices::numbered({"Include flocculation calculations", "Use constant settling velocity"}),
             settlings, &Settlings::noFlocculation);
  form.Check("Include hindered settling calculations", settlings, &Settlings::hinderedSettling);
  form.Radio("Formulation",
             Choices{{Settlings::kWinterwerp, "Use Winterwerp formulation"},
                     {Settlings::kRichardsonZaki, "Use Richardson and Zaki formulation"}},
             settlings, &Settlings::formulation)
      .EnabledIf([settlings] { return settlings().hinderedSettling != 0; });
}

}  // namespace gridbay
