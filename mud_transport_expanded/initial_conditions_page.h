#pragma once

#include <string>

#include "families/area_values_page.h"
#include "mud_transport_expanded/initial_conditions.h"

namespace gridbay {

// A band for each of what is carried.
class CNmtExpInitialConcentrationsGrid final : public AreaValuesGrid<CNmtExpInitialComponentKvs> {
  int EntryCount() override;
  CNmtExpInitialComponentKvs* EntryAt(int number) override;
  std::string BandTitle(int item) override;
  int Quantity(int number) override;
  Choices Formats() override;
  FileKind KindOfFile(std::int32_t format) override;
};

// A band for each layer. What is given for the first area is given for all, but for the map of each.
class CNmtExpInitialBedThicknessGrid final : public AreaValuesGrid<CNmtExpInitialThicknessKvs> {
  int EntryCount() override;
  CNmtExpInitialThicknessKvs* EntryAt(int number) override;
  std::string BandTitle(int item) override;
  int Quantity(int number) override;
  Choices Formats() override;
  FileKind KindOfFile(std::int32_t format) override;
  GridRow FormatRow(GridRow row) override { return {row.item, 1}; }
};

// Layer by fraction: percentages, and their sum.
class CNmtExpBedDistributionGrid final : public ColumnGrid {
  int LayoutKey() override;
  int RowHeaderWidth() override { return 90; }
  std::string RowHeader(GridRow row) override;
  void LayOut() override;
};

// What there is when the calculation begins.
class CNmtExpInitialConditionsDlg final : public Page<18850, PageId::mtExpInitialConditions> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpInitialConcentrationsGrid concentrations_;
  CNmtExpInitialBedThicknessGrid thickness_;
  CNmtExpBedDistributionGrid distribution_;
};

}  // namespace gridbay
