#pragma once

#include <cstdint>

#include "pages/form_view.h"
#include "pages/grid_wnd.h"

namespace gridbay {

// One row for each source or sink, below a second row of headers.
class CSourceSinkGrid final : public ColumnGrid {
 public:
  void Initialize() override;
  int GetRowCount() override { return ItemCount() + 1; }
  std::string GetRowHeader(int row) override { return row <= 1 ? "" : std::to_string(row - 1); }

 protected:
  int ItemCount() override;
  bool styleOf(int row, int col, CellStyle& style) override;
  bool storeCell(int row, int col, std::string_view text) override;
};

// Where water enters or leaves the model.
class CSourceSinkDlg final : public CV27SetupFormView {
 public:
  explicit CSourceSinkDlg(CVdDoc& document) : CV27SetupFormView(document, 18929, PageId::sourceAndSink) {}

  int GetData() override;
  void SetData() override;

 protected:
  void DoDataExchange(Form& form) override;
  int Initialize() override;

 private:
  std::int32_t number_ = 0;
  CSourceSinkGrid grid_;
};

}  // namespace gridbay
