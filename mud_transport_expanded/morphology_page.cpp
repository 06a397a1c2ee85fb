#include "mud_transport_expanded/morphology_page.h"

#include "mud_transport_expanded/morphology.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"

namespace gridbay {

void CNmtExpMorphologyDlg::DoDataExchange(Form& form) {
  using Morphology = CNmtExpMorphologyKvs;
  const auto morphology = objectOf(&MudTransportExpandedParts::nmtExpMorphology);
  const auto isOn = [morphology] { return morphology().includeMorphology != 0; };
  form.Check("Do morphological calculations", morphology, &Morphology::includeMorphology);
  form.Check("Apply speedup factor", morphology, &Morphology::includeSpeedupFactor).EnabledIf(isOn);
  form.Number("Speedup factor", morphology, &Morphology::speedupFactor).EnabledIf([morphology, isOn] {
    return isOn() && morphology().includeSpeedupFactor != 0;
  });
}

}  // namespace gridbay
