#include "mud_transport/sliding_page.h"

#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/sliding.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

CNmtSlidingKvs& slidingOf(CKvsBase& object) {
  return rootMember<&MudTransportParts::nmtSliding>(object);
}

}  // namespace

int ConstantSlidingWords::count(CKvsBase& object) {
  return slidingOf(object).constant.GetCount();
}
CNmtConstantSlidingLayerKvs* ConstantSlidingWords::values(CKvsBase& object, int number) {
  return slidingOf(object).constant.GetItem(number);
}
std::string ConstantSlidingWords::name(CKvsBase&, int number) {
  return std::to_string(number);
}
std::string ConstantSlidingWords::title(CKvsBase& object, int number) {
  return "layer " + name(object, number);
}

CNmtConstantSlidingDlg::CNmtConstantSlidingDlg(CVdDoc& document) : LayerValuesDlg(document) {}
CNmtConstantSlidingDlg::~CNmtConstantSlidingDlg() = default;

void CNmtVariableSlidingGrid::LayOut() {
  MapColumns([this] { return &slidingOf(GetKvs()).variable; });
}

void CNmtVariableSlidingDlg::DoDataExchange(Form& form) {
  const auto variable = [this]() -> CNmtVariableSlidingKvs& { return slidingOf(GetKvs()).variable; };
  listConstantOrMaps(form, "Variable friction coefficient", 0, variable, grid_);
  form.Number("Solid density", variable, &CNmtVariableSlidingKvs::solidDensity, item::kBedDensity);
}

void CNmtSlidingDlg::DoDataExchange(Form& form) {
  using Sliding = CNmtSlidingKvs;
  const auto sliding = objectOf(&MudTransportParts::nmtSliding);
  form.Check("Include sliding", sliding, &Sliding::includeSliding);
  form.Radio("Sliding coefficients",
             Choices::numbered({"Use constant sliding coefficients", "Use variable sliding coefficients"}),
             sliding, &Sliding::includeVariableSlidingCoefficient)
      .EnabledIf([sliding] { return sliding().includeSliding != 0; });
}

}  // namespace gridbay
