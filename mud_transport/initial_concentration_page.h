#pragma once

#include <string>

#include "families/area_values_page.h"
#include "mud_transport/initial_concentration.h"

namespace gridbay {

// A band for each entry. In that of a layer all areas show the one format and constant that it has.
class CNmtInitialConcentrationGrid final : public AreaValuesGrid<CNmtInitialComponentKvs> {
  int EntryCount() override;
  CNmtInitialComponentKvs* EntryAt(int number) override;
  std::string BandTitle(int item) override;
  int Quantity(int number) override;
  Choices Formats() override;
  FileKind KindOfFile(std::int32_t format) override;
  GridRow FormatRow(GridRow row) override;
};

// Concentrations, and the thickness of layers, when the calculation begins.
class CNmtInitialConcentrationDlg final : public Page<18820, PageId::mtInitialConcentration> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Initial conditions", grid_); }

  CNmtInitialConcentrationGrid grid_;
};

}  // namespace gridbay
