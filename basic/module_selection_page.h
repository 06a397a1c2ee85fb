#pragma once

#include <cstdint>

#include "pages/form_view.h"

namespace gridbay {

// Which modules run beside hydrodynamics, the scheme of advection-dispersion, and whether the model is an
// inland one.
class CModuleSelectionDlg final : public CV27SetupFormView {
 public:
  explicit CModuleSelectionDlg(CVdDoc& document)
      : CV27SetupFormView(document, 18716, PageId::moduleSelection) {}

  int GetData() override;
  void SetData() override;

 protected:
  void DoDataExchange(Form& form) override;
  int Initialize() override;

 private:
  void EnableControls();
  void OnChange();

  std::int32_t module_ = -1;
  std::int32_t scheme_ = -1;
  std::int32_t highPrecision_ = 0;
  std::int32_t inlandFlooding_ = 0;
};

}  // namespace gridbay
