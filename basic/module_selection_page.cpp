#include "basic/module_selection_page.h"

#include <algorithm>
#include <array>

#include "basic/basic_parts.h"
#include "basic/module_selection.h"

namespace gridbay {
namespace {

// Module codes by radio button; the last has no button of its own.
constexpr std::array<std::int32_t, 5> kCodes{module::kHydrodynamic, module::kAdvectionDispersion,
                                             module::kMudTransportExpanded, module::kEcological,
                                             module::kHydrodynamicToo};
constexpr std::int32_t kHydrodynamicRadio = 0;
constexpr std::int32_t kMudRadio = 2;

// Schemes by their place in the drop-down list.
constexpr std::array<std::int32_t, 4> kSchemes{1, 5, -5, -1};

// The place of a value, or 0 for one that is not there; and the value of a place, or the first one.
template <std::size_t n>
std::int32_t placeOf(const std::array<std::int32_t, n>& values, std::int32_t value) {
  const auto found = std::ranges::find(values, value);
  return found == values.end() ? 0 : static_cast<std::int32_t>(found - values.begin());
}
template <std::size_t n>
std::int32_t valueAt(const std::array<std::int32_t, n>& values, std::int32_t place) {
  return place >= 0 && place < static_cast<std::int32_t>(n) ? values[static_cast<std::size_t>(place)]
                                                            : values.front();
}

}  // namespace

void CModuleSelectionDlg::DoDataExchange(Form& form) {
  const auto changed = [this] { OnChange(); };
  form.DDX_Radio("Module",
                 {"Hydrodynamic only", "Hydrodynamic and Advection-Dispersion",
                  "Hydrodynamic and Mud Transport", "Hydrodynamic and BIO Rig"},
                 module_)
      .Changed(changed);
  form.Group("AD Scheme");
  form.DDX_CBIndex("Select scheme:", {"QUICKEST", "ULTIMATE", "simple UPWIND", "2D UPWIND"}, scheme_)
      .Changed(changed);
  form.Group("HD Calculations");
  form.DDX_Check("High precision calculations", highPrecision_).Changed([this] { UpdateDoc(); });
  form.DDX_Check("Inland Flooding", inlandFlooding_).Changed(changed);
}

int CModuleSelectionDlg::Initialize() {
  AddAlignRight(*form().find("AD Scheme"));
  AddAlignRight(*form().find("HD Calculations"));
  return 1;
}

void CModuleSelectionDlg::SetData() {
  const CModuleSelectionKvs& selection = *parts<BasicParts>().moduleSelection;
  module_ = placeOf(kCodes, selection.simulationType);
  scheme_ = placeOf(kSchemes, selection.adScheme);
  inlandFlooding_ = selection.hydrodynamicFeatures == 0 ? 1 : 0;
  form().find("HD Calculations")->visible = false;
  form().of(&highPrecision_).visible = false;
  highPrecision_ = selection.highPrecision ? 1 : 0;
  UpdateData(false);
  EnableControls();
}

int CModuleSelectionDlg::GetData() {
  if (!UpdateData(true)) return 0;
  CModuleSelectionKvs& selection = *parts<BasicParts>().moduleSelection;
  selection.simulationType = valueAt(kCodes, module_);
  selection.adScheme = valueAt(kSchemes, scheme_);
  selection.hydrodynamicFeatures = inlandFlooding_ != 0 ? 0 : 1;
  selection.highPrecision = highPrecision_ == 1;
  return 1;
}

// Mud transport and inland flooding exclude each other, whichever is set first.
void CModuleSelectionDlg::EnableControls() {
  form().of(&scheme_).enabled = module_ != kHydrodynamicRadio;
  form().of(&module_).choiceEnabled[kMudRadio] = inlandFlooding_ == 0;
  form().of(&inlandFlooding_).enabled = module_ != kMudRadio;
}

void CModuleSelectionDlg::OnChange() {
  UpdateDoc();
  EnableControls();
}

}  // namespace gridbay
