#pragma once

#include "ecology/constants.h"
#include "ecology/given_values_page.h"

namespace gridbay {

// A row for each constant, and below it one for the map of each area, which are shown while it has maps.
class CWQSConstantsGridDlg final : public GivenGrid<BandedGrid> {
 public:
  RowLook GetRowLook(int row) override;

 private:
  void LayOut() override;
  bool TitleHasCells() override { return true; }
  std::string BandTitle(int) override { return {}; }
  int BandSize(int) override { return areas(); }
  int dataRows() override { return ItemCount() * (1 + areas()); }
  GridRow rowAt(int n) override { return {(n - 1) / (1 + areas()) + 1, (n - 1) % (1 + areas())}; }
  std::string RowHeader(GridRow row) override { return row.sub == 0 ? std::to_string(row.item) : ""; }

  int areas();
  CWQSConstantsItemKvs* constant(int number);

  // Looked up once for all rows: there may be very many.
  CWQSConstantsKvs* list_ = nullptr;
};

class CWQSConstantsDlg final : public Page<18943, PageId::ecoConstants> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Constants", grid_); }

  CWQSConstantsGridDlg grid_;
};

}  // namespace gridbay
