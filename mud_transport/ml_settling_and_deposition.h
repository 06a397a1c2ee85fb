#pragma once

#include "families/layer_values.h"
#include "families/part_row.h"

namespace gridbay {

// The shear stress (N/m²) below which mud comes to rest on the bed.
class CNmtMlShearStressObjectKvs final
    : public AreaMapKvs<CNmtMlShearStressObjectKvs, PageId::mtMlSettlingAndDeposition> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class DepositionShearStressKvs final
    : public ConstantOrMapsKvs<DepositionShearStressKvs, CNmtMlShearStressObjectKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 0.02F;

  static constexpr auto table() {
    return section("CRITICAL_SHEARSTRESS_FOR_DEPOSITION", valueRows(), mapRows());
  }
};

// How the one fraction of the multi layer task settles: in flocs, which grow with the concentration (mg/l)
// and the salinity.
class CNmtMlSettlingAndDepositionKvs final : public TableKvs<CNmtMlSettlingAndDepositionKvs> {
 public:
  enum Profile : std::int32_t { kDynamic = 0, kStationary = 1 };

  explicit CNmtMlSettlingAndDepositionKvs(CKvsBase* parent) : TableKvs(parent) {}

  float relativeHeightOfCentroid = 0.3F;  // above the bed, of the depth
  float factorKon1 = 0.0004F;
  float powerM1 = 0;
  float powerM2 = 1.37F;
  float powerB1 = 0;
  float powerB2 = 0.49F;
  float concentrationC1 = 0;
  float concentrationC2 = 1000;
  float factorKon2 = 1.34e-7F;
  float salinityLimit1 = 340;
  float salinityLimit2 = 10000;
  std::int32_t stationaryProfile = kDynamic;
  std::int32_t useFactorForDeposition = 0;
  float factorForDeposition = 24.88F;
  DepositionShearStressKvs shearStress{this};

  static constexpr auto table() {
    using Self = CNmtMlSettlingAndDepositionKvs;
    return section(
        "SETTLING_AND_DEPOSITION", keyword("Relative_Height_Of_Centroid", &Self::relativeHeightOfCentroid),
        keyword("Factor_kon1", &Self::factorKon1), keyword("Power_M1", &Self::powerM1),
        keyword("Power_M2", &Self::powerM2), keyword("Power_B1", &Self::powerB1),
        keyword("Power_B2", &Self::powerB2), keyword("Concentration_C1", &Self::concentrationC1),
        keyword("Concentration_C2", &Self::concentrationC2), keyword("Factor_kon2", &Self::factorKon2),
        keyword("Salinity_limit1", &Self::salinityLimit1), keyword("Salinity_limit2", &Self::salinityLimit2),
        keyword("Stationary_Profile", &Self::stationaryProfile),
        keyword("Use_Factor_for_depositon", &Self::useFactorForDeposition),
        keyword("Factor_for_depositon", &Self::factorForDeposition), part(&Self::shearStress));
  }

  // The model has n areas now.
  void SetNoAreas(int n) { shearStress.SetCount(n); }

  unsigned Validate(ValidationList& messages, int deep) override {
    return shearStress.Validate(messages, deep);
  }
};

}  // namespace gridbay
