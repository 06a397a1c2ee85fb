#pragma once

#include "families/starting_conditions.h"

namespace gridbay {

// The hot start file of an area: an item for each state variable, transported or not.
class CWQSStartingConditionsGridItemKvs final : public HotStartFileKvs<CWQSStartingConditionsGridItemKvs> {
 public:
  using HotStartFileKvs::HotStartFileKvs;
  using HotStartFileKvs::Validate;

  // Area `number`, from 1.
  unsigned Validate(ValidationList& messages, int deep, int number);
  void RequestFile(CVdFileSelectorDlg& selector, int number);
};

// What the ecological model begins from.
class CWQSStartingConditionsKvs final
    : public HotStartKvs<CWQSStartingConditionsKvs, CWQSStartingConditionsGridItemKvs> {
 public:
  using HotStartKvs::HotStartKvs;

  static constexpr auto table() { return section("STARTING_CONDITIONS", hotStartRow(), hotFileRows()); }
};

}  // namespace gridbay
