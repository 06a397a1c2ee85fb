#pragma once

#include "structures/line_structure_page.h"

namespace gridbay {

// Where each weir stands, its type and its losses.
class CWeirGrid final : public LineStructureGrid {
  void LayOut() override;
};

// The parameters of each weir; those of its type can be edited.
class CWeirDataGrid final : public LineStructureGrid {
  void LayOut() override;
};

class CNHdWeirDlg final : public Page<18713, PageId::weirs> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CWeirGrid grid_;
  CWeirDataGrid dataGrid_;
};

}  // namespace gridbay
