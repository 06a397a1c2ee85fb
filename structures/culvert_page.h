#pragma once

#include "structures/line_structure_page.h"

namespace gridbay {

// Where each culvert lies, and its losses.
class CCulvertGrid final : public LineStructureGrid {
  void LayOut() override;
};

// The section and the course of each culvert; what describes its section can be edited.
class CCulvertDataGrid final : public LineStructureGrid {
  void LayOut() override;
};

class CNHdCulvertDlg final : public Page<18709, PageId::culverts> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CCulvertGrid grid_;
  CCulvertDataGrid dataGrid_;
};

}  // namespace gridbay
