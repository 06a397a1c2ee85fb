#pragma once

#include <cstdint>

#include "advection_dispersion/texts.h"
#include "core/table_kvs.h"

namespace gridbay {

// Whether what is transported changes the density of the water in the flow calculation, by a salinity and a
// temperature that are constant or each those of a component.
class CNadFeedbackKvs final : public TableKvs<CNadFeedbackKvs> {
 public:
  static constexpr std::int32_t kConstant = 0;
  static constexpr std::int32_t kVarying = 1;

  using TableKvs::TableKvs;

  bool isIncluded = false;
  std::int32_t salinityDescription = kVarying;
  float constantSalinity = 7;          // PSU
  std::int32_t salinityComponent = 1;  // from 1
  std::int32_t temperatureDescription = kConstant;
  float constantTemperature = 10;  // degrees Celsius
  std::int32_t temperatureComponent = 1;

  static constexpr auto table() {
    using Self = CNadFeedbackKvs;
    return section("AD_FEED_BACK_ON_HD_CALCULATIONS", keyword("Include_AD_Feed_Back", &Self::isIncluded),
                   keyword("Salinity_Description", &Self::salinityDescription),
                   keyword("Constant_Salinity", &Self::constantSalinity),
                   keyword("Salinity_Item_Number", &Self::salinityComponent),
                   keyword("Temperature_Description", &Self::temperatureDescription),
                   keyword("Constant_Temperature", &Self::constantTemperature),
                   keyword("Temperature_Item_Number", &Self::temperatureComponent));
  }

  unsigned Validate(ValidationList& messages, int deep) override;
};

}  // namespace gridbay
