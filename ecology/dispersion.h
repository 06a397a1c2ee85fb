#pragma once

#include "families/dispersion.h"

namespace gridbay {

class CWQSADDispersionItemKvs final : public DispersionFileKvs<CWQSADDispersionItemKvs> {
 public:
  using DispersionFileKvs::DispersionFileKvs;

  static constexpr PageId kPage = PageId::ecoDispersion;
};

// The dispersion of all transported variables.
class CWQSADDispersionKvs final
    : public DispersionCoefKvs<CWQSADDispersionKvs, CWQSADDispersionItemKvs, double> {
 public:
  using DispersionCoefKvs::DispersionCoefKvs;

  static constexpr std::string_view kSection = "AD_DISPERSION";
  static constexpr PageId kPage = PageId::ecoDispersion;
  static constexpr Text kAreaMissing{};  // passed over
};

}  // namespace gridbay
