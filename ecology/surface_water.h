#pragma once

#include "ecology/transported.h"
#include "families/result_texts.h"
#include "families/surface_values.h"

namespace gridbay {

// The transported variables in the water that rains, evaporates or infiltrates. They are checked whether
// there is such water or not.
template <class Self>
class WqsSurfaceWaterKvs : public SurfaceValuesKvs<Self, WqsVariables> {
 public:
  using SurfaceValuesKvs<Self, WqsVariables>::SurfaceValuesKvs;

  static constexpr Text kFileNotValid = texts::resultFileNotValid;

  double newConstant(int variable) { return WqsVariables::defaultValue(*this, variable); }
  unsigned CheckConstant(ValidationList& messages, int, int variable) {
    return checkRange(messages, Self::kPage, WqsVariables::declaration(*this, variable),
                      *this->Constant(variable), WqsVariables::name(*this, variable));
  }
};

}  // namespace gridbay
