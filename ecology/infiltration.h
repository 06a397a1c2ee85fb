#pragma once

#include "ecology/surface_water.h"

namespace gridbay {

// The transported variables in the water that infiltrates.
class CWQSADInfiltrationKvs final : public WqsSurfaceWaterKvs<CWQSADInfiltrationKvs> {
 public:
  using WqsSurfaceWaterKvs::WqsSurfaceWaterKvs;

  static constexpr std::string_view kSection = "INFILTRATION";
  static constexpr PageId kPage = PageId::ecoInfiltration;
  static constexpr std::int32_t kFormat = kFromAmbientWater;
};

}  // namespace gridbay
