#pragma once

#include "families/starting_conditions.h"

namespace gridbay {

// The hot start file of an area.
class CNmtExpHotStartObjectKvs final : public HotStartFileKvs<CNmtExpHotStartObjectKvs> {
 public:
  using HotStartFileKvs::HotStartFileKvs;
  using HotStartFileKvs::Validate;

  // Checks the file of area `number` (from 1). That of area 1 also sets how many fractions and layers there
  // are, and brings salinity: a check that changes the model.
  unsigned Validate(ValidationList& messages, int deep, int number);
  // What the file of area `number` must be.
  void RequestFile(CVdFileSelectorDlg& selector, int number);

 private:
  unsigned takeCounts(ValidationList& messages, const TsbHeader& header);
};

// When the transport runs, over which time steps it is integrated, and what it begins from.
class CNmtExpStartingConditionsKvs final
    : public StartingConditionsKvs<CNmtExpStartingConditionsKvs, CNmtExpHotStartObjectKvs> {
 public:
  static constexpr PageId kPage = PageId::mtExpStartingConditions;

  explicit CNmtExpStartingConditionsKvs(CKvsBase* parent)
      : StartingConditionsKvs(parent), integrationEnd(lastStep) {}

  std::int32_t integrationStart = 0;
  std::int32_t integrationEnd;

  static constexpr auto table() {
    using Self = CNmtExpStartingConditionsKvs;
    return section("STARTING_CONDITIONS", hotStartRow(),
                   keyword("Start_MT_at_HD_Time_Step", &Self::firstStep),
                   keyword("End_MT_at_HD_Time_Step", &Self::lastStep),
                   keyword(kIntegrationStart, &Self::integrationStart),
                   keyword(kIntegrationEnd, &Self::integrationEnd), hotFileRows());
  }

  // Both ranges become those steps.
  void SetPeriod(std::int32_t first, std::int32_t last) {
    firstStep = integrationStart = first;
    lastStep = integrationEnd = last;
  }

  // The integration period may also stand in a section beside, which has the last word.
  void Load(KvsSection section, const std::string& documentPath) override;

 private:
  static constexpr std::string_view kIntegrationStart = "Integration_period_start";
  static constexpr std::string_view kIntegrationEnd = "Integration_period_end";
};

}  // namespace gridbay
