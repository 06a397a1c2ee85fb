#pragma once

#include "pages/form_view.h"

namespace gridbay {

// Whether the bathymetry changes.
class CNmtExpMorphologyDlg final : public Page<18854, PageId::mtExpMorphology> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
