#pragma once

#include "families/area_list.h"
#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"
#include "platform/units/units.h"

namespace gridbay {

// The height of the roughness of the bed in an area, in metres.
class CNmtExpBedRoughnessObjectKvs final : public ValueOrMapKvs<CNmtExpBedRoughnessObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpBedRoughness;
  static constexpr Text kDescription = texts::bed::roughness;
  static constexpr int kQuantity = item::kRoughnessHeight;
};

// Of all areas.
class CNmtExpBedRoughnessKvs final
    : public AreaListKvs<CNmtExpBedRoughnessKvs, CNmtExpBedRoughnessObjectKvs> {
 public:
  using AreaListKvs::AreaListKvs;

  static constexpr auto table() { return section("BED_ROUGHNESS", items("AREA_%d")); }
  static void initialise(CNmtExpBedRoughnessObjectKvs& area, int) { area.value = 0.001F; }
};

}  // namespace gridbay
