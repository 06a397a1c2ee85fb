#pragma once

#include <cstdint>

#include "core/table_kvs.h"

namespace gridbay {

// Whether what erodes and settles changes the bathymetry, and how many times faster than in nature.
class CNmtExpMorphologyKvs final : public TableKvs<CNmtExpMorphologyKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t includeMorphology = 0;
  std::int32_t includeSpeedupFactor = 0;
  float speedupFactor = 1;

  static constexpr auto table() {
    using Self = CNmtExpMorphologyKvs;
    return section("MORPHOLOGY", keyword("Include_Morphology", &Self::includeMorphology),
                   keyword("Include_Speedup_Factor", &Self::includeSpeedupFactor),
                   keyword("Speedup_Factor", &Self::speedupFactor));
  }
};

}  // namespace gridbay
