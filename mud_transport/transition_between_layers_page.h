#pragma once

#include "families/layer_values_page.h"
#include "mud_transport/mud_transport_parts.h"

namespace gridbay {

// The rates are plain numbers, as they stand on file.
struct TransitionBetweenLayersWords : LayersOfRoot<&MudTransportParts::nmtTransitionBetweenLayers> {
  static constexpr std::string_view kLabel = "Transition rates of mud";
  static constexpr int kQuantity = 0;
};
class CNmtTransitionBetweenLayersGrid1 final : public LayerValuesGrid<TransitionBetweenLayersWords> {};
class CNmtTransitionBetweenLayersGrid2 final : public LayerMapsGrid<CNmtTransitionBetweenLayersGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// How fast the mud of each layer goes over into the layer below.
class CNmtTransitionBetweenLayersDlg final
    : public LayerValuesDlg<18836, PageId::mtTransitionBetweenLayers, TransitionBetweenLayersWords,
                            CNmtTransitionBetweenLayersGrid1, CNmtTransitionBetweenLayersGrid2> {
 public:
  explicit CNmtTransitionBetweenLayersDlg(CVdDoc& document);
  ~CNmtTransitionBetweenLayersDlg() override;

 private:
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
