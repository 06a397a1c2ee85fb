#pragma once

#include "families/layer_values.h"
#include "families/part_row.h"

namespace gridbay {

// The friction coefficient of each layer, while it does not vary with the bed.
class CNmtConstantSlidingMapKvs final
    : public AreaMapKvs<CNmtConstantSlidingMapKvs, PageId::mtConstantSliding> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtConstantSlidingLayerKvs final
    : public ConstantOrMapsKvs<CNmtConstantSlidingLayerKvs, CNmtConstantSlidingMapKvs, double> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr double kDefault = 0.0001;
};
class CNmtConstantSlidingKvs final
    : public LayerValuesKvs<CNmtConstantSlidingKvs, CNmtConstantSlidingLayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  static constexpr std::string_view kSection = "CONSTANT_SLIDING_COEFFICIENT";
};

// The friction coefficient that varies with the bed: one for all layers.
class CNmtVariableSlidingObjectKvs final
    : public AreaMapKvs<CNmtVariableSlidingObjectKvs, PageId::mtVariableSliding> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtVariableSlidingKvs final
    : public ConstantOrMapsKvs<CNmtVariableSlidingKvs, CNmtVariableSlidingObjectKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 0.0001F;

  float solidDensity = 2650;  // kg/m³

  static constexpr auto table() {
    return section("VARIABLE_SLIDING_COEFFICIENT", valueRows(),
                   keyword("Solid_Density", &CNmtVariableSlidingKvs::solidDensity), mapRows());
  }
};

// Whether the layers slide down slopes, and by which of the two coefficients. Both are on file, and their
// maps are checked, whether they are used or not.
class CNmtSlidingKvs final : public TableKvs<CNmtSlidingKvs> {
 public:
  explicit CNmtSlidingKvs(CKvsBase* parent) : TableKvs(parent) {}

  std::int32_t includeSliding = 0;
  std::int32_t includeVariableSlidingCoefficient = 0;
  CNmtConstantSlidingKvs constant{this};
  CNmtVariableSlidingKvs variable{this};

  static constexpr auto table() {
    using Self = CNmtSlidingKvs;
    return section("SLIDING", keyword("Include_Sliding", &Self::includeSliding),
                   keyword("Include_variable_sliding_coefficient", &Self::includeVariableSlidingCoefficient),
                   part(&Self::constant), part(&Self::variable));
  }

  // The model has n layers, or n areas, now. A negative number does nothing.
  void SetCount(int n) { constant.SetCount(n); }
  void SetNoAreas(int n) {
    constant.SetNoAreas(n);
    variable.SetCount(n);
  }

  unsigned Validate(ValidationList& messages, int deep) override {
    const unsigned faults = constant.Validate(messages, deep);
    return faults + variable.Validate(messages, deep);
  }
};

}  // namespace gridbay
