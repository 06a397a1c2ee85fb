#pragma once

#include <cstdint>

#include "core/table_kvs.h"

namespace gridbay {

// Whether mud slides down the bed, and whether the coefficient of it is one for each layer or varies.
class CNmtExpSlidingKvs final : public TableKvs<CNmtExpSlidingKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t includeSliding = 0;
  std::int32_t includeVariableCoefficient = 0;

  static constexpr auto table() {
    using Self = CNmtExpSlidingKvs;
    return keywords(keyword("Include_sliding", &Self::includeSliding),
                    keyword("Include_variable_sliding_coefficient", &Self::includeVariableCoefficient));
  }
};

}  // namespace gridbay
