#pragma once

#include "core/table_kvs.h"

namespace gridbay {

// The viscosity of the water with its sediment. It is kept while the model is open, and its section is empty.
class CNmtExpWaterColParametersKvs final : public TableKvs<CNmtExpWaterColParametersKvs> {
 public:
  using TableKvs::TableKvs;

  float c1Visc = 10;
  float c2Visc = 600;

  static constexpr auto table() {
    using Self = CNmtExpWaterColParametersKvs;
    return section("VISCOSITY_PARAMETERS", offFile(&Self::c1Visc, &Self::c2Visc));
  }
  void CopyFrom(const CKvsBase& other) override { AssignState(other); }
};

}  // namespace gridbay
