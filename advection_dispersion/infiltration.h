#pragma once

#include "advection_dispersion/transported.h"
#include "families/surface_values.h"

namespace gridbay {

// The concentrations of all components in the water that infiltrates.
class CNadInfiltrationKvs final : public SurfaceValuesKvs<CNadInfiltrationKvs, AdComponents> {
 public:
  using SurfaceValuesKvs::SurfaceValuesKvs;

  static constexpr std::string_view kSection = "INFILTRATION_CONCENTRATIONS";
  static constexpr PageId kPage = PageId::adInfiltration;
  static constexpr std::int32_t kFormat = kFromAmbientWater;

  // As for evaporation: it is rain and evaporation that are asked, not infiltration.
  bool Applies();
};

}  // namespace gridbay
