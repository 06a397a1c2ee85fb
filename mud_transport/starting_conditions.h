#pragma once

#include <cstdint>

#include "families/starting_conditions.h"

namespace gridbay {

// The hot start file of an area.
class CNmtHotStartObjectKvs final : public HotStartFileKvs<CNmtHotStartObjectKvs> {
 public:
  using HotStartFileKvs::HotStartFileKvs;
  using HotStartFileKvs::Validate;

  // Checks the file of area `number` (from 1). That of area 1 also sets the task with its counts, where it
  // has a block that says it: a check that changes the model.
  unsigned Validate(ValidationList& messages, int deep, int number);
  // What the file of area `number` must be.
  void RequestFile(CVdFileSelectorDlg& selector, int number);

 private:
  bool takeTask(const TsbHeader& header);
};

// When the transport runs, what it begins from, and over which time steps it is summed up.
class CNmtStartingConditionsKvs final
    : public StartingConditionsKvs<CNmtStartingConditionsKvs, CNmtHotStartObjectKvs> {
 public:
  static constexpr PageId kPage = PageId::mtStartingConditions;

  explicit CNmtStartingConditionsKvs(CKvsBase* parent)
      : StartingConditionsKvs(parent), integrationEnd(lastTimeStep(*this)) {}

  std::int32_t integrationStart = 0;
  std::int32_t integrationEnd;
  float maximumDecrease = 0.1F;  // of a concentration in a step, as a part of it

  static constexpr auto table() {
    using Self = CNmtStartingConditionsKvs;
    constexpr auto start = keyword("Integration_period_start", &Self::integrationStart);
    constexpr auto end = keyword("Integration_period_end", &Self::integrationEnd);
    return keywords(
        section("STARTING_CONDITIONS", hotStartRow(), keyword("Start_MT_at_HD_Time_Step", &Self::firstStep),
                keyword("End_MT_at_HD_Time_Step", &Self::lastStep), start, end, hotFileRows()),
        section("CALCULATION_METHOD", keyword("Max_rel_decrease_in_conc_pr_step", &Self::maximumDecrease),
                readOnly(start), readOnly(end)));
  }
};

}  // namespace gridbay
