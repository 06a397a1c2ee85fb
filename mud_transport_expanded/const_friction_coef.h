#pragma once

#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"
#include "platform/units/units.h"

namespace gridbay {

// The coefficient by which a layer of the bed slides in an area.
class CNmtExpConstFrictionCoefObjectKvs final : public ValueOrMapKvs<CNmtExpConstFrictionCoefObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpConstFrictionCoef;
  static constexpr Text kDescription = texts::bed::frictionCoefficient;
  static constexpr int kQuantity = 0;
};

// Of a layer in each area.
class CNmtExpConstFrictionCoefComponentKvs final
    : public AreaValuesKvs<CNmtExpConstFrictionCoefComponentKvs, CNmtExpConstFrictionCoefObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

// Of all layers, where sliding does not vary.
class CNmtExpConstFrictionCoefKvs final
    : public EntryAreasKvs<CNmtExpConstFrictionCoefKvs, CNmtExpConstFrictionCoefComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  static constexpr std::string_view kSection = "Constant_sliding_coefficient";
  static constexpr std::string_view kEntrySection = "BED_LAYER_%d";

  static float newValue(int) { return 0.0001F; }
};

}  // namespace gridbay
