#pragma once

#include "mud_transport_expanded/state_items.h"

namespace gridbay {

// The power by which the erosion of a layer of the bed rises with the shear stress. On file it stands with
// the layer's erosion coefficient.
class CNmtExpPowerOfErosionObjectKvs final : public TableKvs<CNmtExpPowerOfErosionObjectKvs> {
 public:
  using TableKvs::TableKvs;

  float power = 1;

  static constexpr auto table() { return keywords(offFile(&CNmtExpPowerOfErosionObjectKvs::power)); }
  void CopyFrom(const CKvsBase& other) override { AssignState(other); }
};

// That of all layers.
class CNmtExpPowerOfErosionKvs final
    : public ListKvs<CNmtExpPowerOfErosionKvs, CNmtExpPowerOfErosionObjectKvs> {
 public:
  using ListKvs::ListKvs;

  static constexpr auto table() { return keywords(stateItems()); }
};

}  // namespace gridbay
