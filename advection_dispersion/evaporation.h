#pragma once

#include "advection_dispersion/transported.h"
#include "families/surface_values.h"

namespace gridbay {

// The concentrations of all components in the water that evaporates.
class CNadEvaporationKvs final : public SurfaceValuesKvs<CNadEvaporationKvs, AdComponents> {
 public:
  using SurfaceValuesKvs::SurfaceValuesKvs;

  static constexpr std::string_view kSection = "EVAPORATION_CONCENTRATIONS";
  static constexpr PageId kPage = PageId::adEvaporation;
  static constexpr std::int32_t kFormat = kConstant;

  // Whether water evaporates, also as a part of net precipitation.
  bool Applies();
};

}  // namespace gridbay
