#pragma once

#include <cstdint>

#include "pages/form_view.h"

namespace gridbay {

// The thresholds of flooding and drying. Their check box is never shown, so the flag stays as the file has
// it.
class CAreaDescriptionDlg final : public CV27SetupFormView {
 public:
  explicit CAreaDescriptionDlg(CVdDoc& document) : CV27SetupFormView(document, 18702, PageId::floodAndDry) {}

  int GetData() override;
  void SetData() override;

 protected:
  void DoDataExchange(Form& form) override;

 private:
  std::int32_t enable_ = 0;
  float dryingDepth_ = 0;
  float floodingDepth_ = 0;
};

}  // namespace gridbay
