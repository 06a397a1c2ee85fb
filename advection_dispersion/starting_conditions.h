#pragma once

#include "families/starting_conditions.h"

namespace gridbay {

// The hot start file of an area: an item for each component, and behind them one with their types.
class CNadHotStartObjectKvs final : public HotStartFileKvs<CNadHotStartObjectKvs> {
 public:
  using HotStartFileKvs::HotStartFileKvs;
  using HotStartFileKvs::Validate;

  // Checks the file of area `number` (from 1). That of area 1 also sets the list of components, their names
  // and their types: a check that changes the model.
  unsigned Validate(ValidationList& messages, int deep, int number);
  // What the file of area `number` must be.
  void RequestFile(CVdFileSelectorDlg& selector, int number);

 private:
  unsigned takeComponents(ValidationList& messages, TsbHeader& header);
};

// When the transport runs, and what it begins from.
class CNadStartingConditionsKvs final
    : public StartingConditionsKvs<CNadStartingConditionsKvs, CNadHotStartObjectKvs> {
 public:
  static constexpr PageId kPage = PageId::adStartingConditions;

  using StartingConditionsKvs::StartingConditionsKvs;

  static constexpr auto table() {
    using Self = CNadStartingConditionsKvs;
    return section("STARTING_CONDITIONS", hotStartRow(),
                   keyword("Start_AD_at_HD_Time_Step", &Self::firstStep),
                   keyword("End_AD_at_HD_Time_Step", &Self::lastStep), hotFileRows());
  }
};

}  // namespace gridbay
