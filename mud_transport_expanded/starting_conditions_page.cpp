#include "mud_transport_expanded/starting_conditions_page.h"

namespace gridbay {

void CNmtExpStartingConditionsDlg::AddBelow(Form& form) {
  using Start = CNmtExpStartingConditionsKvs;
  form.Group("Calculation Method", [&] {
    form.Group("Integration period:", [&] {
      form.Number("First:", holder(), &Start::integrationStart);
      form.Number("Last:", holder(), &Start::integrationEnd).Beside();
    });
  });
}

}  // namespace gridbay
