#pragma once

#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"

namespace gridbay {

// The velocity at which a fraction settles in an area, in m/s; with flocculation the coefficient of it.
class CNmtExpFallVelocityObjectKvs final : public ValueOrMapKvs<CNmtExpFallVelocityObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpSettlingPar;
  static constexpr Text kDescription = texts::bed::fallVelocity;
  static constexpr int kQuantity = 0;
};

// Of a fraction in each area, and the exponents of its flocculation and of its hindered settling.
class CNmtExpFallVelocityComponentKvs final
    : public AreaValuesKvs<CNmtExpFallVelocityComponentKvs, CNmtExpFallVelocityObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;

  float gamma = 1;
  float wsn = 1;

  static constexpr auto table() {
    return keywords(keyword("Gamma", &CNmtExpFallVelocityComponentKvs::gamma),
                    keyword("Wsn", &CNmtExpFallVelocityComponentKvs::wsn), items("AREA_%d"));
  }
};

// How all fractions settle. Densities and concentrations in kg/m³.
class CNmtExpSettlingParKvs final
    : public EntryAreasKvs<CNmtExpSettlingParKvs, CNmtExpFallVelocityComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  float rhoSed = 2650;    // of the grains
  float gelPoint = 50;    // above which the suspension is a gel
  float cHinder = 10;     // above which settling is hindered
  float c1Salt = -0.33F;  // of the influence that salinity has on flocculation
  float c2Salt = 0.01F;
  float cFloc = 0;  // above which grains flocculate

  static constexpr auto table() {
    using Self = CNmtExpSettlingParKvs;
    return keywords(keyword("RhoSed", &Self::rhoSed), keyword("GelPoint", &Self::gelPoint),
                    keyword("CHinder", &Self::cHinder), keyword("C1Salt", &Self::c1Salt),
                    keyword("C2Salt", &Self::c2Salt), keyword("Cfloc", &Self::cFloc),
                    items("SEDIMENT_FRACTION_%d"));
  }
  // By whether grains flocculate at present.
  float newValue(int fraction);
};

}  // namespace gridbay
