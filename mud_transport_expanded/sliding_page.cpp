#include "mud_transport_expanded/sliding_page.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/sliding.h"

namespace gridbay {

void CNmtExpSlidingDlg::DoDataExchange(Form& form) {
  const auto sliding = objectOf(&MudTransportExpandedParts::nmtExpSliding);
  form.Check("Include sliding", sliding, &CNmtExpSlidingKvs::includeSliding);
  form.Radio("Coefficients",
             Choices::numbered({"Use constant sliding coefficients", "Use variable sliding coefficients"}),
             sliding, &CNmtExpSlidingKvs::includeVariableCoefficient)
      .EnabledIf([sliding] { return sliding().includeSliding != 0; });
}

}  // namespace gridbay
