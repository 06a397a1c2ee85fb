#pragma once

#include "advection_dispersion/component_coefficients.h"
#include "platform/units/units.h"

namespace gridbay {

class CNadDecaySpecificationObjectKvs final
    : public ComponentCoefficientKvs<CNadDecaySpecificationObjectKvs> {
 public:
  using ComponentCoefficientKvs::ComponentCoefficientKvs;

  static constexpr Text kDescription = texts::decayingRequest;
  static constexpr int kQuantity = item::kDecayCoefficient;
};

// How fast each decaying component decays.
class CNadDecaySpecificationKvs final
    : public ComponentCoefficientsKvs<CNadDecaySpecificationKvs, CNadDecaySpecificationObjectKvs> {
 public:
  using ComponentCoefficientsKvs::ComponentCoefficientsKvs;

  static constexpr std::string_view kSection = "DECAY_COEFFICIENTS";
  static constexpr Text kMissing = texts::decaySectionMissing;
  static constexpr PageId kPage = PageId::adDecaySpecification;
  static constexpr std::int32_t kComponentType = CNadComponentObjectKvs::kDecaying;
};

}  // namespace gridbay
