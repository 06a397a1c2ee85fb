#pragma once

#include "families/dispersion.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {

class CNmtExpDispersionCoefObjectKvs final : public DispersionFileKvs<CNmtExpDispersionCoefObjectKvs> {
 public:
  using DispersionFileKvs::DispersionFileKvs;

  static constexpr PageId kPage = PageId::mtExpDispersionCoef;
};

// The dispersion of all that is carried.
class CNmtExpDispersionCoefKvs final
    : public DispersionCoefKvs<CNmtExpDispersionCoefKvs, CNmtExpDispersionCoefObjectKvs> {
 public:
  using DispersionCoefKvs::DispersionCoefKvs;

  static constexpr std::string_view kSection = "DISPERSION_CONDITIONS";
  static constexpr PageId kPage = PageId::mtExpDispersionCoef;
  static constexpr Text kAreaMissing = texts::expDispersionSectionMissing;
};

}  // namespace gridbay
