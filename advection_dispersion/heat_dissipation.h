#pragma once

#include "advection_dispersion/component_coefficients.h"
#include "platform/units/units.h"

namespace gridbay {

class CNadHeatDissipationObjectKvs final : public ComponentCoefficientKvs<CNadHeatDissipationObjectKvs> {
 public:
  using ComponentCoefficientKvs::ComponentCoefficientKvs;

  static constexpr Text kDescription = texts::heatDissipationRequest;
  static constexpr int kQuantity = item::kTemperature;
};

// How the heat of each dissipating component is lost.
class CNadHeatDissipationKvs final
    : public ComponentCoefficientsKvs<CNadHeatDissipationKvs, CNadHeatDissipationObjectKvs> {
 public:
  using ComponentCoefficientsKvs::ComponentCoefficientsKvs;

  static constexpr std::string_view kSection = "HEAT_DISSIPATION";
  static constexpr Text kMissing = texts::heatDissipationSectionMissing;
  static constexpr PageId kPage = PageId::adHeatDissipation;
  static constexpr std::int32_t kComponentType = CNadComponentObjectKvs::kHeatDissipating;
};

}  // namespace gridbay
