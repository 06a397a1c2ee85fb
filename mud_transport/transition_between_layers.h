#pragma once

#include "families/layer_values.h"

namespace gridbay {

// How fast the mud of each layer goes over into the layer below.
class CNmtTransitionBetweenLayersMapKvs final
    : public AreaMapKvs<CNmtTransitionBetweenLayersMapKvs, PageId::mtTransitionBetweenLayers> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtTransitionBetweenLayersLayerKvs final
    : public ConstantOrMapsKvs<CNmtTransitionBetweenLayersLayerKvs, CNmtTransitionBetweenLayersMapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 1;
};
class CNmtTransitionBetweenLayersKvs final
    : public LayerValuesKvs<CNmtTransitionBetweenLayersKvs, CNmtTransitionBetweenLayersLayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  std::int32_t includeTransition = 0;

  static constexpr auto table() {
    return section("TRANSITION_OF_MUD_BETWEEN_LAYERS",
                   keyword("Include_transition_of_mud_within_layers",
                           &CNmtTransitionBetweenLayersKvs::includeTransition),
                   layerRows());
  }
};

}  // namespace gridbay
