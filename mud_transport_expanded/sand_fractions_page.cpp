#include "mud_transport_expanded/sand_fractions_page.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/sand_fractions.h"
#include "platform/units/units.h"

namespace gridbay {

void CNmtExpSandFractionValueGrid::LayOut() {
  using Fraction = CNmtExpSandFractionObjectKvs;
  const auto fraction = RowsOf(&MudTransportExpandedParts::nmtExpSandFractions);
  Number("Mean fall velocity", 120, fraction, &Fraction::meanFallVelocity, item::kSettlingVelocity)
      .EnabledIf([fraction](GridRow row) { return fraction(row)->isSand != 0; });
}

void CNmtExpSandFractionsDlg::DoDataExchange(Form& form) {
  form.Grid("Sand fractions", grid_);
}

}  // namespace gridbay
