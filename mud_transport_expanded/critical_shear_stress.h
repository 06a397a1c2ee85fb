#pragma once

#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"
#include "platform/units/units.h"

namespace gridbay {

// The shear stress above which a layer of the bed erodes in an area, in N/m².
class CNmtExpCriticalShearStressObjectKvs final : public ValueOrMapKvs<CNmtExpCriticalShearStressObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpCriticalShearStress;
  static constexpr Text kDescription = texts::bed::criticalShearStress;
  static constexpr int kQuantity = item::kShearStress;
};

// Of a layer in each area.
class CNmtExpCriticalShearStressComponentKvs final
    : public AreaValuesKvs<CNmtExpCriticalShearStressComponentKvs, CNmtExpCriticalShearStressObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

// Of all layers: the deeper, the firmer.
class CNmtExpCriticalShearStressKvs final
    : public EntryAreasKvs<CNmtExpCriticalShearStressKvs, CNmtExpCriticalShearStressComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  static constexpr std::string_view kSection = "CRITICAL_SHEAR_STRESS_EROSION";
  static constexpr std::string_view kEntrySection = "BED_LAYER_%d";

  static float newValue(int layer) {
    constexpr int kFirst = 10;
    constexpr int kStep = 15;
    return static_cast<float>(kFirst + kStep * (layer - 1)) / 100;
  }
};

}  // namespace gridbay
