#pragma once

#include <cstdint>

#include "mud_transport_expanded/state_items.h"

namespace gridbay {

// How a layer of the bed erodes. On file it stands with the layer's erosion coefficient.
class CNmtExpErosionDescriptionObjectKvs final : public TableKvs<CNmtExpErosionDescriptionObjectKvs> {
 public:
  enum Description : std::int32_t { kDense = 0, kSoft = 1 };

  using TableKvs::TableKvs;

  std::int32_t description = kDense;

  static constexpr auto table() {
    return keywords(offFile(&CNmtExpErosionDescriptionObjectKvs::description));
  }
  void CopyFrom(const CKvsBase& other) override { AssignState(other); }
};

// How all layers erode: the first is soft, as what has settled of late.
class CNmtExpErosionLayerKvs final
    : public ListKvs<CNmtExpErosionLayerKvs, CNmtExpErosionDescriptionObjectKvs> {
 public:
  using ListKvs::ListKvs;

  float cMax = 50;  // to which the concentration rises by erosion at most, kg/m³

  static constexpr auto table() {
    return keywords(keyword("CMax", &CNmtExpErosionLayerKvs::cMax), stateItems());
  }
  void initialise(CNmtExpErosionDescriptionObjectKvs& layer, int number) {
    using Layer = CNmtExpErosionDescriptionObjectKvs;
    layer.description = number == 1 ? Layer::kSoft : Layer::kDense;
  }
};

}  // namespace gridbay
