#pragma once

#include "pages/form_view.h"

namespace gridbay {

// Where the waves come from, and what they do.
class CNmtExpWavesDlg final : public Page<18870, PageId::mtExpWaves> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

// One wave for the whole model and simulation.
class CNmtExpConstantWavesDlg final : public Page<18868, PageId::mtExpConstantWaves> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

// Waves from a data file.
class CNmtExpTSVWaves final : public Page<18865, PageId::mtExpTsvWaves> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
