#pragma once

#include <cstdint>

#include "advection_dispersion/texts.h"
#include "core/file_selector.h"
#include "core/table_kvs.h"

namespace gridbay {

// How the one component of the type heat exchange takes heat from the atmosphere and gives it back.
class CNadHeatExchangeKvs final : public TableKvs<CNadHeatExchangeKvs> {
 public:
  // How an input is given. Only the air temperature may vary in space.
  enum Format : std::int32_t {
    kConstant = -1,
    kType0File = 0,
    kType2File = 2,
  };

  using TableKvs::TableKvs;

  std::int32_t integrationOrder = 1;  // 1, 2 or 4
  bool latentHeatTemperature = false;
  float angstromA = 0.295F;
  float angstromB = 0.371F;
  float daltonA = 0.5F;
  float daltonB = 0.9F;
  std::int32_t relativeHumidity = 88;  // percent
  float standardMeridian = 0;          // degrees
  float displacementHours = 0;
  std::int32_t airFormat = kConstant;
  float airTemperature = 20;  // degrees Celsius
  std::int32_t clearnessFormat = kConstant;
  std::int32_t humidityFormat = kConstant;
  std::int32_t clearness = 70;  // percent
  UTsbSelection airFile{1};
  UTsbSelection humidityFile{1};
  UTsbSelection clearnessFile{1};

  static constexpr auto table() {
    using Self = CNadHeatExchangeKvs;
    return section(
        "HEAT_EXCHANGE", keyword("RKorder", &Self::integrationOrder),
        keyword("EvapPrecipTemp", &Self::latentHeatTemperature), keyword("AngstromsLawA", &Self::angstromA),
        keyword("AngstromsLawB", &Self::angstromB), keyword("DaltonsLawA", &Self::daltonA),
        keyword("DaltonsLawB", &Self::daltonB), keyword("RelativeHumidity", &Self::relativeHumidity),
        keyword("StandardMeridian", &Self::standardMeridian),
        keyword("DisplacementHours", &Self::displacementHours), keyword("AirFormat", &Self::airFormat),
        keyword("AirConstantValue", &Self::airTemperature),
        keyword("ClearnessFormat", &Self::clearnessFormat), keyword("HumidityFormat", &Self::humidityFormat),
        keyword("Clearness", &Self::clearness), section("AIR_FILE", selection(&Self::airFile)),
        section("HUMIDITY_FILE", selection(&Self::humidityFile)),
        section("CLEARNESS_FILE", selection(&Self::clearnessFile)));
  }

  // Checks the files that are used, in a model that exchanges the heat of just one component.
  unsigned Validate(ValidationList& messages, int deep) override;

  // What the files must be.
  void RequestAirFile(CVdFileSelectorDlg& selector);
  void RequestHumidityFile(CVdFileSelectorDlg& selector);
  void RequestClearnessFile(CVdFileSelectorDlg& selector);

 private:
  void requestSeries(CVdFileSelectorDlg& selector, const Text& description);
};

}  // namespace gridbay
