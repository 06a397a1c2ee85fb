#include "mud_transport_expanded/settling_par_page.h"

#include "mud_transport_expanded/settlings.h"
#include "platform/units/units.h"

namespace gridbay {

int CNmtExpFallVelocityGrid::Quantity(int) {
  return parts<MudTransportExpandedParts>().nmtExpSettlings->isConstant() ? item::kSettlingVelocity : 0;
}

void CNmtExpSettlingParGrid::LayOut() {
  using Fraction = CNmtExpFallVelocityComponentKvs;
  const auto fraction = RowsOf(&MudTransportExpandedParts::nmtExpSettlingPar);
  const auto settlings = host().objectOf(&MudTransportExpandedParts::nmtExpSettlings);
  Number("Gamma", 80, fraction, &Fraction::gamma).EnabledIf([settlings](GridRow) {
    return !settlings().isConstant();
  });
  Number("Wsn", 80, fraction, &Fraction::wsn).EnabledIf([settlings](GridRow) {
    return settlings().hinderedSettling != 0;
  });
}

void CNmtExpSettlingParDlg::DoDataExchange(Form& form) {
  using Par = CNmtExpSettlingParKvs;
  const auto par = objectOf(&MudTransportExpandedParts::nmtExpSettlingPar);
  const auto settlings = objectOf(&MudTransportExpandedParts::nmtExpSettlings);
  form.Number("RhoSed", par, &Par::rhoSed, item::kBedDensity);
  form.Group("Hindered settling",
             [&] {
               form.Number("GelPoint", par, &Par::gelPoint, item::kSuspendedSediment);
               form.Number("CHinder", par, &Par::cHinder, item::kSuspendedSediment);
             })
      .EnabledIf([settlings] { return settlings().hinderedSettling != 0; });
  form.Group("Flocculation",
             [&] {
               form.Number("C1Salt", par, &Par::c1Salt);
               form.Number("C2Salt", par, &Par::c2Salt);
               form.Number("Cfloc", par, &Par::cFloc, item::kSuspendedSediment);
             })
      .EnabledIf([settlings] { return !settlings().isConstant(); });
  form.Grid("Fall velocity", velocities_);
  form.Grid("Exponents", exponents_);
}

}  // namespace gridbay
