#pragma once

#include <cstdint>

#include "basic/basic_parts.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"

namespace gridbay {

// One column for each polygon: its area, its number of corners, and the corners below.
class CMassBudgetGrid final : public CV27SetupGridWnd {
 public:
  int GetRowCount() override;
  int GetColCount() override;
  std::string GetColHeader(int col) override { return col == 0 ? "Polygon" : std::to_string(col); }
  std::string GetRowHeader(int row) override;
  int GetColWidth(int col) override;

 protected:
  bool styleOf(int row, int col, CellStyle& style) override;
  bool storeCell(int row, int col, std::string_view text) override;
  std::string editName(int row, int col) override;
};

// The polygons of the mass budget, for a transport module with one of two schemes.
class CMassBudgetDlg final : public CV27SetupFormView {
 public:
  explicit CMassBudgetDlg(CVdDoc& document) : CV27SetupFormView(document, 18715, PageId::massBudget) {}

  int GetData() override;
  void SetData() override;
  // Whether the model's module and scheme have a mass budget.
  static bool IsAvailable(BasicParts& basic);

 protected:
  void DoDataExchange(Form& form) override;
  int Initialize() override;

 private:
  std::int32_t number_ = 0;
  CMassBudgetGrid grid_;
};

}  // namespace gridbay
