#pragma once

#include "advection_dispersion/texts.h"
#include "families/dispersion.h"

namespace gridbay {

class CNadDispersionCoefObjectKvs final : public DispersionFileKvs<CNadDispersionCoefObjectKvs> {
 public:
  using DispersionFileKvs::DispersionFileKvs;

  static constexpr PageId kPage = PageId::adDispersionCoef;
};

// The dispersion of all components.
class CNadDispersionCoefKvs final
    : public DispersionCoefKvs<CNadDispersionCoefKvs, CNadDispersionCoefObjectKvs> {
 public:
  using DispersionCoefKvs::DispersionCoefKvs;

  static constexpr std::string_view kSection = "DISPERSION_CONDITIONS";
  static constexpr PageId kPage = PageId::adDispersionCoef;
  static constexpr Text kAreaMissing = texts::adDispersionSectionMissing;
};

}  // namespace gridbay
