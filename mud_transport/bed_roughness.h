#pragma once

#include "families/layer_values.h"

namespace gridbay {

// The roughness of the bed (metres), as its shear stress is found with it.
class CNmtBedRoughnessObjectKvs final : public AreaMapKvs<CNmtBedRoughnessObjectKvs, PageId::mtBedRoughness> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtBedRoughnessKvs final : public ConstantOrMapsKvs<CNmtBedRoughnessKvs, CNmtBedRoughnessObjectKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 0.001F;

  static constexpr auto table() { return section("BED_ROUGHNESS", valueRows(), mapRows()); }
};

}  // namespace gridbay
