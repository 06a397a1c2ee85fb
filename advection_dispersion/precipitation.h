#pragma once

#include "advection_dispersion/transported.h"
#include "families/surface_values.h"

namespace gridbay {

// The concentrations of all components in rain.
class CNadPrecipitationKvs final : public SurfaceValuesKvs<CNadPrecipitationKvs, AdComponents> {
 public:
  using SurfaceValuesKvs::SurfaceValuesKvs;

  static constexpr std::string_view kSection = "PRECIPITATION_CONCENTRATIONS";
  static constexpr PageId kPage = PageId::adPrecipitation;
  static constexpr std::int32_t kFormat = kConstant;

  // Whether it rains at all.
  bool Applies();
};

}  // namespace gridbay
