#include "basic/area_description_page.h"

#include "basic/area_description.h"
#include "basic/basic_parts.h"
#include "platform/units/units.h"

namespace gridbay {

void CAreaDescriptionDlg::DoDataExchange(Form& form) {
  const auto changed = [this] { UpdateDoc(); };
  form.DDX_Check("Enable flooding and drying", enable_).Hidden();
  form.DDX_VDedit("Drying depth:", dryingDepth_, item::kFloodDepth).Changed(changed);
  form.DDX_VDedit("Flooding depth:", floodingDepth_, item::kFloodDepth).Changed(changed);
}

void CAreaDescriptionDlg::SetData() {
  const CAreaDescriptionKvs& area = *parts<BasicParts>().areaDescription;
  enable_ = area.enableFloodAndDryChecking;
  dryingDepth_ = area.dryingDepth;
  floodingDepth_ = area.floodingDepth;
  form().of(&dryingDepth_).enabled = enable_ != 0;
  form().of(&floodingDepth_).enabled = enable_ != 0;
  UpdateData(false);
}

int CAreaDescriptionDlg::GetData() {
  if (!UpdateData(true)) return 0;
  CAreaDescriptionKvs& area = *parts<BasicParts>().areaDescription;
  area.enableFloodAndDryChecking = enable_;
  area.dryingDepth = dryingDepth_;
  area.floodingDepth = floodingDepth_;
  return 1;
}

}  // namespace gridbay
