#include "basic/module_selection_page.h"

#include "basic/basic_parts.h"
#include "basic/module_selection.h"

namespace gridbay {
namespace {

enum Place { kHydrodynamics, kAdvection, kMud, kEcology, kHydrodynamicsToo };

}  // namespace

// Mud transport and inland flooding exclude each other, whichever is set first.
void CModuleSelectionDlg::DoDataExchange(Form& form) {
  using Selection = CModuleSelectionKvs;
  const auto selection = objectOf(&BasicParts::moduleSelection);
  const Choices modules = Choices{
      {module::kHydrodynamic, "Hydrodynamic only"},
      {module::kAdvectionDispersion, "Hydrodynamic and Advection-Dispersion"},
      {module::kMudTransportExpanded, "Hydrodynamic and Mud Transport"},
      {module::kEcological, "Hydrodynamic and BIO Rig"},
      {module::kHydrodynamicToo,
       ""}}.Otherwise(kHydrodynamics);
  const Choices schemes =
      Choices{{1, "QUICKEST"}, {5, "ULTIMATE"}, {-5, "simple UPWIND"}, {-1, "2D UPWIND"}}.Otherwise(0);
  const auto isChosen = [=](Place place) { return modules.placeOf(selection().simulationType) == place; };
  const auto isInland = [=] { return selection().hydrodynamicFeatures == 0; };

  form.Radio("Module", modules, selection, &Selection::simulationType).ChoicesIf([=](int place) {
    return place != kMud || !isInland();
  });
  Control& scheme = form.Group("AD Scheme", [&] {
    form.List("Select scheme:", schemes, selection, &Selection::adScheme).EnabledIf([=] {
      return !isChosen(kHydrodynamics);
    });
  });
  Control& calculations = form.Group("HD Calculations", [&] {
    form.Check("High precision calculations", selection, &Selection::highPrecision).Hidden();
  });
  form.Check("Inland Flooding", selection, &Selection::hydrodynamicFeatures, 0, 1).EnabledIf([=] {
    return !isChosen(kMud);
  });
  AddAlignRight(scheme);
  AddAlignRight(calculations.Hidden());
}

}  // namespace gridbay
