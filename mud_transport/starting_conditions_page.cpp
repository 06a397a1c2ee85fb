#include "mud_transport/starting_conditions_page.h"

namespace gridbay {

void CNmtStartingConditionsDlg::AddBelow(Form& form) {
  using Conditions = CNmtStartingConditionsKvs;
  form.Group("Calculation Method", [&] {
    form.Group("Integration period:", [&] {
      form.Number("First:", holder(), &Conditions::integrationStart);
      form.Number("Last:", holder(), &Conditions::integrationEnd).Beside();
    });
    form.Number("Max relative decrease:", holder(), &Conditions::maximumDecrease);
  });
}

}  // namespace gridbay
