#pragma once

#include <cstdint>

#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"
#include "platform/units/units.h"

namespace gridbay {

// The shear stress below which a fraction settles in an area, in N/m².
class CNmtExpDepositionObjectKvs final : public ValueOrMapKvs<CNmtExpDepositionObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpDeposition;
  static constexpr Text kDescription = texts::bed::criticalShearStressOfDeposition;
  static constexpr int kQuantity = item::kShearStress;
};

// Of a fraction in each area.
class CNmtExpDepositionComponentKvs final
    : public AreaValuesKvs<CNmtExpDepositionComponentKvs, CNmtExpDepositionObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

// How the sediment is distributed over the depth, and the critical shear stresses of all fractions.
class CNmtExpDepositionKvs final : public EntryAreasKvs<CNmtExpDepositionKvs, CNmtExpDepositionComponentKvs> {
 public:
  enum Profile : std::int32_t { kRouse = 0, kTeeter = 1 };

  using EntryAreasKvs::EntryAreasKvs;

  std::int32_t sedimentProfile = kTeeter;
  float centroidHeight = 0.3F;  // of the sediment above the bed, relative to the depth

  static constexpr auto table() {
    return section("DEPOSITION_PARAMETERS",
                   keyword("Sediment_Profile_Description", &CNmtExpDepositionKvs::sedimentProfile),
                   keyword("CentroidHeight", &CNmtExpDepositionKvs::centroidHeight),
                   section("CRITICAL_SHEAR_STRESS_DEPOSITION", items("SEDIMENT_FRACTION_%d")));
  }
  static float newValue(int) { return 0.07F; }
};

}  // namespace gridbay
