#pragma once

#include "pages/form_view.h"

namespace gridbay {

// Which modules run beside hydrodynamics, the scheme of advection-dispersion, and whether the model is an
// inland one.
class CModuleSelectionDlg final : public Page<18716, PageId::moduleSelection> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
