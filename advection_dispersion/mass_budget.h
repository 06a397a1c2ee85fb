#pragma once

#include "advection_dispersion/entries.h"
#include "families/mass_budget.h"

namespace gridbay {

struct NadMassBudget {
  using Item = MassFile;

  static constexpr PageId kPage = PageId::adMassBudget;
  static constexpr std::string_view kCount = "NoOfMassFiles";
  static constexpr auto entryRows() {
    return section("SIMPLE_COMPONENTS",
                   countThenNumbers("NoOfSimpleComponents", "ComponentNumbers", &MassFile::entries));
  }
  static std::vector<std::string> entryNames(CKvsBase& object) { return componentNames(object); }
};

// The mass of components in a polygon, and all such files. They do not follow the count of components.
using CNadMassBudgetItemKvs = MassFileKvs<NadMassBudget>;
class CNadMassBudgetKvs final : public MassFilesKvs<NadMassBudget> {
 public:
  using MassFilesKvs::MassFilesKvs;

  // Of each file the first component alone, for when their count has been changed by the user.
  void ChooseFirstComponent() {
    for (int number = 1; number <= GetCount(); ++number) GetMassFile(number)->entries = {1};
  }
};

}  // namespace gridbay
