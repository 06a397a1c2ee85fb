#pragma once

#include <cstdint>

#include "pages/form_view.h"
#include "pages/grid_wnd.h"

namespace gridbay {

// One row for each boundary with its first and last point.
class CBoundaryGrid final : public ColumnGrid {
 public:
  void Initialize() override;

 protected:
  int ItemCount() override;
};

// The open boundaries: found along the border of Area 1, or given by the user.
class CBoundaryDlg final : public CV27SetupFormView {
 public:
  explicit CBoundaryDlg(CVdDoc& document) : CV27SetupFormView(document, 18704, PageId::boundary) {}

  // With "Program detected" each hand-over finds the boundaries anew, and resets the conditions at all of
  // them.
  int GetData() override;
  void SetData() override;

 protected:
  void DoDataExchange(Form& form) override;
  int Initialize() override;

 private:
  std::int32_t position_ = -1;
  std::int32_t number_ = 0;
  CBoundaryGrid grid_;
};

}  // namespace gridbay
