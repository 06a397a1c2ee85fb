#include "basic/area_description_page.h"

#include "basic/area_description.h"
#include "basic/basic_parts.h"
#include "platform/units/units.h"

namespace gridbay {

void CAreaDescriptionDlg::DoDataExchange(Form& form) {
  using Area = CAreaDescriptionKvs;
  const auto area = objectOf(&BasicParts::areaDescription);
  const auto isOn = [area] { return area().enableFloodAndDryChecking != 0; };
  form.Check("Enable flooding and drying", area, &Area::enableFloodAndDryChecking).Hidden();
  form.Number("Drying depth:", area, &Area::dryingDepth, item::kFloodDepth).EnabledIf(isOn);
  form.Number("Flooding depth:", area, &Area::floodingDepth, item::kFloodDepth).EnabledIf(isOn);
}

}  // namespace gridbay
