#pragma once

#include <cstdint>

#include "core/file_selector.h"
#include "core/selections.h"
#include "families/area_list.h"
#include "hydrodynamic/texts.h"

namespace gridbay {

// The water level of an area at the start of the simulation (metres).
class CNhdSurfaceElevationObjectKvs final : public TableKvs<CNhdSurfaceElevationObjectKvs> {
 public:
  static constexpr std::int32_t kConstant = 1;
  static constexpr std::int32_t kFromFile = 2;

  using TableKvs::TableKvs;

  std::int32_t type = kConstant;
  float constantValue = 0;
  UTsbSelection map{1};

  static constexpr auto table() {
    using Self = CNhdSurfaceElevationObjectKvs;
    return keywords(keyword("Type", &Self::type), keyword("Constant_Value", &Self::constantValue),
                    selection(&Self::map, 1));
  }

  using TableKvs::Validate;
  // `number` from 1, here and below: that of the entry and of its area.
  unsigned Validate(ValidationList& messages, int deep, int number);
  void RequestMap(CVdFileSelectorDlg& selector, int number);
};

class CNhdSurfaceElevationKvs final
    : public AreaListKvs<CNhdSurfaceElevationKvs, CNhdSurfaceElevationObjectKvs> {
 public:
  static constexpr PageId kPage = PageId::surfaceElevation;
  static constexpr Text kCountDiffers = texts::surfaceElevationCountDiffers;

  using AreaListKvs::AreaListKvs;

  static constexpr auto table() {
    return section("SURFACE_ELEVATION", items("AREA_%d", texts::surfaceElevationSectionMissing));
  }
};

}  // namespace gridbay
