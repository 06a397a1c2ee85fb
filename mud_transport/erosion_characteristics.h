#pragma once

#include <cstdint>

#include "core/list_kvs.h"

namespace gridbay {

// What erodes, and by which method, in the multi fraction task.
class CNmtMfErosionCharacteristicsKvs final : public TableKvs<CNmtMfErosionCharacteristicsKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t bedIsErodible = 1;
  std::int32_t depositedSedimentErodible = 1;
  std::int32_t onlyCohesiveSediment = 1;
  float scaleFactor = 1;

  static constexpr auto table() {
    using Self = CNmtMfErosionCharacteristicsKvs;
    return section(
        "EROSION_CHARACTERISTICS",
        section("SETTINGS", keyword("Bed_Is_Erodible", &Self::bedIsErodible),
                keyword("Deposited_Sediment_Erodible", &Self::depositedSedimentErodible)),
        section("CALCULATION_METHOD", keyword("Only_cohesive_sediment", &Self::onlyCohesiveSediment),
                writtenOnly(
                    "Cohesive_and_non_cohesive_sediment",
                    [](const Self& self) -> std::int32_t { return self.onlyCohesiveSediment == 0 ? 1 : 0; }),
                keyword("Scale_factor", &Self::scaleFactor)));
  }
};

// How the layers erode in the multi layer task: by one coefficient, or by two factors.
class CNmtMlErosionCharacteristicsKvs final : public TableKvs<CNmtMlErosionCharacteristicsKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t instantaneousErosionOfLayer1 = 0;
  std::int32_t useConstantErosionCoefficient = 1;

  static constexpr auto table() {
    using Self = CNmtMlErosionCharacteristicsKvs;
    return section(
        "EROSION_CHARACTERISTICS",
        section("SETTINGS",
                keyword("Include_Instantaneous_Erosion_Of_Layer_1", &Self::instantaneousErosionOfLayer1),
                keyword("Use_Constant_Erosion_Coefficient", &Self::useConstantErosionCoefficient)));
  }
};

// Whether a layer erodes as a dense bed or as a soft one.
class CNmtErosionLayerObjectKvs final : public TableKvs<CNmtErosionLayerObjectKvs> {
 public:
  static constexpr std::int32_t kSoft = 0;
  static constexpr std::int32_t kDense = 1;

  using TableKvs::TableKvs;

  std::int32_t isDense = kDense;

  static constexpr auto table() {
    using Self = CNmtErosionLayerObjectKvs;
    return keywords(keyword("Include_Erosion_Of_Dense_Bed", &Self::isDense),
                    writtenOnly("Include_Erosion_Of_Soft_Bed",
                                [](const Self& self) -> std::int32_t { return self.isDense == 0 ? 1 : 0; }));
  }
};

// The same for all layers; follows their count.
class CNmtErosionLayerKvs final : public ListKvs<CNmtErosionLayerKvs, CNmtErosionLayerObjectKvs> {
 public:
  using ListKvs::ListKvs;

  static constexpr auto table() { return section("BED_SOFTNESS_PARAMETERS", items("LAYER_%d")); }
};

}  // namespace gridbay
