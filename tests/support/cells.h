#pragma once

#include <string>
#include <string_view>

#include "pages/form_view.h"
#include "pages/grid_wnd.h"

namespace gridbay::test {

// A grid with one cell of each kind that the pages of this version have none of.
class CellsOfAllKinds final : public CV27SetupGridWnd {
 public:
  enum Column { kResultFile = 1, kProjection, kCheckBox, kHidden };

  int GetRowCount() override { return 1; }
  int GetColCount() override { return 4; }
  std::string GetColHeader(int col) override { return "column " + std::to_string(col); }
  int GetColWidth(int col) override { return col == kHidden ? 0 : 80; }

  std::string file = "old";
  std::string projection = "UTM-40";
  bool flag = false;
  bool enabled = true;

 protected:
  bool styleOf(int, int col, CellStyle& style) override {
    style.kind = col == kResultFile   ? CellKind::resultFile
                 : col == kProjection ? CellKind::mapProjection
                                      : CellKind::checkBox;
    style.value = col == kResultFile ? file : col == kProjection ? projection : flag ? "1" : "0";
    style.enabled = enabled;
    return true;
  }
  Stored storeCell(int, int col, std::string_view text) override {
    if (col == kResultFile) file = text;
    if (col == kProjection) projection = text;
    if (col == kCheckBox) flag = text == "1";
    return Stored::taken;
  }
  void setUpResultFile(int, int, CVdGridResultFileEditCtrl& control) override {
    control.SetDialogPara("Maps (*.tsb2)|*.tsb2||", "tsb2");
  }
};

class OnePage final : public CV27SetupFormView {
 public:
  explicit OnePage(CVdDoc& document) : CV27SetupFormView(document, 1, PageId::bathymetry) {}
  CellsOfAllKinds cells;

 protected:
  void DoDataExchange(Form& form) override { form.DDX_Control("&Cells:", cells); }
};

}  // namespace gridbay::test
