#pragma once

#include <string>

#include "advection_dispersion/initial_concentration.h"
#include "families/area_values_page.h"

namespace gridbay {

// A band for each component.
class CNadInitialConcentrationGrid final : public AreaValuesGrid<CNadInitialComponentKvs> {
  int EntryCount() override;
  CNadInitialComponentKvs* EntryAt(int number) override;
  std::string BandTitle(int item) override;
  int Quantity(int number) override;
  Choices Formats() override;
  FileKind KindOfFile(std::int32_t format) override;
};

// The concentrations when the calculation begins.
class CNadInitialConcentrationDlg final : public Page<18729, PageId::adInitialConcentration> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Initial concentrations", grid_); }

  CNadInitialConcentrationGrid grid_;
};

}  // namespace gridbay
