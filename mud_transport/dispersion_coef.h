#pragma once

#include "families/dispersion.h"
#include "mud_transport/texts.h"

namespace gridbay {

class CNmtDispersionCoefObjectKvs final : public DispersionFileKvs<CNmtDispersionCoefObjectKvs> {
 public:
  using DispersionFileKvs::DispersionFileKvs;

  static constexpr PageId kPage = PageId::mtDispersionCoef;
};

// The dispersion of all fractions.
class CNmtDispersionCoefKvs final
    : public DispersionCoefKvs<CNmtDispersionCoefKvs, CNmtDispersionCoefObjectKvs> {
 public:
  using DispersionCoefKvs::DispersionCoefKvs;

  static constexpr std::string_view kSection = "DISPERSION_CONDITIONS";
  static constexpr PageId kPage = PageId::mtDispersionCoef;
  static constexpr Text kAreaMissing = texts::mtDispersionSectionMissing;
};

}  // namespace gridbay
