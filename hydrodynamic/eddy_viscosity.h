#pragma once

#include <cstdint>

#include "core/file_selector.h"
#include "core/selections.h"
#include "families/area_list.h"
#include "hydrodynamic/texts.h"

namespace gridbay {

// The eddy viscosity of an area (m²/s), or the constant of the formula that it is found by.
class CNhdEddyViscosityObjectKvs final : public TableKvs<CNhdEddyViscosityObjectKvs> {
 public:
  using TableKvs::TableKvs;

  float constantValue = 0;
  float smagorinskyConstant = 0.5F;
  UTsbSelection map{1};

  static constexpr auto table() {
    using Self = CNhdEddyViscosityObjectKvs;
    return keywords(keyword("Constant_Value", &Self::constantValue),
                    keyword("Smagorinsky_Format", &Self::smagorinskyConstant), selection(&Self::map, 1));
  }

  using TableKvs::Validate;
  // `number` from 1, here and below: that of the entry and of its area.
  unsigned Validate(ValidationList& messages, int deep, int number);
  void RequestMap(CVdFileSelectorDlg& selector, int number);
};

// How turbulence is described, for all areas alike.
class CNhdEddyViscosityKvs final : public AreaListKvs<CNhdEddyViscosityKvs, CNhdEddyViscosityObjectKvs> {
 public:
  enum DataFormat : std::int32_t { kNone = 0, kConstant = 1, kFromFile = 2, kSmagorinsky = 3 };
  enum Formulation : std::int32_t { kFluxBased = 0, kVelocityBased = 1 };

  static constexpr PageId kPage = PageId::eddyViscosity;
  static constexpr Text kCountDiffers = texts::eddyViscosityCountDiffers;

  using AreaListKvs::AreaListKvs;

  std::int32_t dataFormat = kNone;
  std::int32_t formulation = kVelocityBased;

  static constexpr auto table() {
    using Self = CNhdEddyViscosityKvs;
    return section(
        "EDDY_VISCOSITY", pinned(keyword("Data_Format", &Self::dataFormat), std::int32_t{kNone}, Pin::onLoad),
        pinned(keyword("Formulation", &Self::formulation), std::int32_t{kVelocityBased}, Pin::onLoad),
        items("AREA_%d", texts::eddyViscositySectionMissing));
  }
};

}  // namespace gridbay
