#pragma once

#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"
#include "platform/units/units.h"

namespace gridbay {

// The dry density of a layer of the bed in an area, in kg/m³.
class CNmtExpBedDensityObjectKvs final : public ValueOrMapKvs<CNmtExpBedDensityObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpBedDensity;
  static constexpr Text kDescription = texts::bed::density;
  static constexpr int kQuantity = item::kBedDensity;
};

// Of a layer in each area.
class CNmtExpBedDensityComponentKvs final
    : public AreaValuesKvs<CNmtExpBedDensityComponentKvs, CNmtExpBedDensityObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

// Of all layers: the deeper, the denser.
class CNmtExpBedDensityKvs final : public EntryAreasKvs<CNmtExpBedDensityKvs, CNmtExpBedDensityComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  static constexpr std::string_view kSection = "DENSITY_OF_BED_MATERIAL";
  static constexpr std::string_view kEntrySection = "BED_LAYER_%d";

  static float newValue(int layer) {
    constexpr float kFirst = 180;
    constexpr float kStep = 150;
    return layer == 1 ? kFirst : kStep * static_cast<float>(layer);
  }
};

}  // namespace gridbay
