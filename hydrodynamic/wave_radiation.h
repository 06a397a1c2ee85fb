#pragma once

#include <cstdint>

#include "core/file_name.h"
#include "core/file_selector.h"
#include "families/area_list.h"
#include "hydrodynamic/texts.h"

namespace gridbay {

// The wave radiation stresses that drive the flow of an area, as a wave model gives them.
class CNhdWaveRadiationObjectKvs final : public TableKvs<CNhdWaveRadiationObjectKvs> {
 public:
  static constexpr std::int32_t kStationary = 0;
  static constexpr std::int32_t kQuasiStationary = 1;

  using TableKvs::TableKvs;

  std::int32_t included = 0;
  std::int32_t timeDescription = kStationary;
  UFileName fileName;

  static constexpr auto table() {
    using Self = CNhdWaveRadiationObjectKvs;
    return keywords(pinned(flag("Included", &Self::included), std::int32_t{0}),
                    keyword("FILE_TIME_DESCR", &Self::timeDescription),
                    section("DATA_FILE", keyword("FILE_NAME", &Self::fileName)));
  }

  using TableKvs::Validate;
  // `number` from 1, here and below: that of the entry and of its area.
  unsigned Validate(ValidationList& messages, int deep, int number);
  void RequestFile(CVdFileSelectorDlg& selector, int number);
};

class CNhdWaveRadiationKvs final : public AreaListKvs<CNhdWaveRadiationKvs, CNhdWaveRadiationObjectKvs> {
 public:
  static constexpr PageId kPage = PageId::waveRadiation;
  static constexpr Text kCountDiffers = texts::waveRadiationCountDiffers;

  using AreaListKvs::AreaListKvs;

  // A section that is missing is told in the words of the eddy viscosity.
  static constexpr auto table() {
    return section("WAVE_RADIATION", items("AREA_%d", texts::eddyViscositySectionMissing));
  }
};

}  // namespace gridbay
