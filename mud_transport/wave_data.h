#pragma once

#include <cstdint>

#include "core/file_selector.h"
#include "core/table_kvs.h"

namespace gridbay {

// The waves that stir up the bed: a constant one, or wave fields from a data file. Heights and depths in
// metres, periods in seconds, angles in degrees.
class CNmtWaveDataKvs final : public TableKvs<CNmtWaveDataKvs> {
 public:
  enum Description : std::int32_t { kExcluded = 0, kIncluded = 1 };
  enum Input : std::int32_t { kConstant = 0, kFromFile = 1 };

  using TableKvs::TableKvs;

  std::int32_t description = kExcluded;
  std::int32_t input = kConstant;
  std::int32_t useDatabase = 0;  // otherwise the fields of the file are interpolated in time
  float significantHeight = 1;
  float significantPeriod = 5;
  float angleWithTrueNorth = 180;
  std::int32_t includeLiquefaction = 0;
  float liquefactionFactor = 1;
  float minimumDepth = 1;
  UTsbSelection file{1};

  static constexpr auto table() {
    using Self = CNmtWaveDataKvs;
    return section(
        "WAVE_DATA", keyword("Wave_Description", &Self::description), keyword("Wave_Input", &Self::input),
        flag("Use_database", &Self::useDatabase),
        writtenOnly("Use_interpolation_in_time", [](const Self& self) { return self.useDatabase == 0; }),
        keyword("Significant_Waveheight", &Self::significantHeight),
        keyword("Significant_Waveperiod", &Self::significantPeriod),
        keyword("Angle_With_True_North", &Self::angleWithTrueNorth),
        keyword("Include_Liquefaction", &Self::includeLiquefaction),
        keyword("Liquefaction_Factor", &Self::liquefactionFactor),
        keyword("Minimum_water_depth_for_including_waves", &Self::minimumDepth), selection(&Self::file));
  }

  // Whether the calculation takes its waves from the file: only then it is checked.
  bool IsFromFile() const { return description != kExcluded && input == kFromFile; }

  unsigned Validate(ValidationList& messages, int deep) override;
  void RequestDataFile(CVdFileSelectorDlg& selector);
};

}  // namespace gridbay
