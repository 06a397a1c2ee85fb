#include "mud_transport/transition_between_layers_page.h"

#include "mud_transport/transition_between_layers.h"

namespace gridbay {

CNmtTransitionBetweenLayersDlg::CNmtTransitionBetweenLayersDlg(CVdDoc& document) : LayerValuesDlg(document) {}
CNmtTransitionBetweenLayersDlg::~CNmtTransitionBetweenLayersDlg() = default;

void CNmtTransitionBetweenLayersDlg::DoDataExchange(Form& form) {
  form.Check("Include transition of mud between layers",
             objectOf(&MudTransportParts::nmtTransitionBetweenLayers),
             &CNmtTransitionBetweenLayersKvs::includeTransition);
  LayerValuesDlg::DoDataExchange(form);
}

}  // namespace gridbay
