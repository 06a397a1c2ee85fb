#pragma once

#include "ecology/surface_water.h"

namespace gridbay {

// The transported variables in the water that evaporates.
class CWQSADEvaporationKvs final : public WqsSurfaceWaterKvs<CWQSADEvaporationKvs> {
 public:
  using WqsSurfaceWaterKvs::WqsSurfaceWaterKvs;

  static constexpr std::string_view kSection = "EVAPORATION";
  static constexpr PageId kPage = PageId::ecoEvaporation;
  static constexpr std::int32_t kFormat = kConstant;
};

}  // namespace gridbay
