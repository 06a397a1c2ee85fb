#pragma once

#include "families/area_list.h"
#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"

namespace gridbay {

// The coefficient by which mud slides in an area, where it varies.
class CNmtExpVarFrictionCoefObjectKvs final : public ValueOrMapKvs<CNmtExpVarFrictionCoefObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpVarFrictionCoef;
  static constexpr Text kDescription = texts::bed::frictionCoefficient;
  static constexpr int kQuantity = 0;
};

// Of all areas.
class CNmtExpVarFrictionCoefKvs final
    : public AreaListKvs<CNmtExpVarFrictionCoefKvs, CNmtExpVarFrictionCoefObjectKvs> {
 public:
  using AreaListKvs::AreaListKvs;

  float solidDensity = 2650;  // of the grains, kg/m³

  static constexpr auto table() {
    return section("Variable_sliding_coefficient",
                   keyword("Solid_Density", &CNmtExpVarFrictionCoefKvs::solidDensity), items("AREA_%d"));
  }
  static void initialise(CNmtExpVarFrictionCoefObjectKvs& area, int) { area.value = 0.0001F; }
};

}  // namespace gridbay
