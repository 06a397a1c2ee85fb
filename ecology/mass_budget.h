#pragma once

#include "ecology/output_choice.h"
#include "families/mass_budget.h"

namespace gridbay {

struct WqsMassBudget {
  using Item = MassFile;

  static constexpr PageId kPage = PageId::ecoMassBudget;
  static constexpr std::string_view kCount = "No_Of_Mass_Files";
  static constexpr auto entryRows() {
    return section("STATE_VARIABLES",
                   countThenNumbers("Number_Selected", "Selected_State_Variables", &MassFile::entries));
  }
  static std::vector<std::string> entryNames(CKvsBase& object) { return stateVariableNames(object); }
};

// The mass of state variables in a polygon, and all such files.
using CWQSMassBudgetItemKvs = MassFileKvs<WqsMassBudget>;
class CWQSMassBudgetKvs final : public MassFilesKvs<WqsMassBudget> {
 public:
  using MassFilesKvs::MassFilesKvs;

  // The choice of each file as new, for other variables. The files stay.
  void Rebuild() {
    for (int number = 1; number <= GetCount(); ++number) GetMassFile(number)->entries = {1};
  }
};

}  // namespace gridbay
