#include "mud_transport/result_page.h"

namespace gridbay {

void CNmtResultDlg::DoDataExchange(Form& form) {
  using Results = CNmtResultKvs;
  const auto results = objectOf(&MudTransportParts::nmtResult);
  listOutputControls(form, results, "Size of MT output", outputs_);
  form.Check("Include layers in output", results, &Results::includeLayers);
  const Choices units =
      Choices{{1, "Net sedimentation in mm"}, {0, "Net sedimentation in g/m^2"}}.Otherwise(0);
  form.Radio("Net sedimentation", units, results, &Results::netSedimentationInMm);
  listHotStartControls(form, results, "Generate hot Start", hotStarts_);
}

}  // namespace gridbay
