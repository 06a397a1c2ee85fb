#pragma once

#include <string>

#include "ecology/initial_conditions.h"
#include "families/area_values_page.h"

namespace gridbay {

// A band for each transported state variable.
class CWQSInitialConditionsGridDlg final : public AreaValuesGrid<CWQSInitialConditionsStateVariableKvs> {
  int EntryCount() override;
  CWQSInitialConditionsStateVariableKvs* EntryAt(int number) override;
  std::string BandTitle(int item) override;
  int Quantity(int number) override;
  std::string ValueTip(int number) override;
  bool HasUnits() override { return true; }
  std::string UnitOf(int number) override;
  Choices Formats() override;
  FileKind KindOfFile(std::int32_t format) override;
};

class CWQSInitialConditionsDlg final : public Page<18945, PageId::ecoInitialConditions> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Initial conditions", grid_); }

  CWQSInitialConditionsGridDlg grid_;
};

}  // namespace gridbay
