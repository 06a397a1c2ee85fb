#pragma once

#include "ecology/surface_water.h"

namespace gridbay {

// The transported variables in the water that rains.
class CWQSADPrecipitationKvs final : public WqsSurfaceWaterKvs<CWQSADPrecipitationKvs> {
 public:
  using WqsSurfaceWaterKvs::WqsSurfaceWaterKvs;

  static constexpr std::string_view kSection = "PRECIPITATION";
  static constexpr PageId kPage = PageId::ecoPrecipitation;
  static constexpr std::int32_t kFormat = kConstant;
};

}  // namespace gridbay
