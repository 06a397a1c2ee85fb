#include "mud_transport/bed_roughness_page.h"

#include "mud_transport/bed_roughness.h"
#include "mud_transport/mud_transport_parts.h"
#include "platform/units/units.h"

namespace gridbay {

void CNmtBedRoughnessGrid::LayOut() {
  MapColumns([this] { return parts<MudTransportParts>().nmtBedRoughness.get(); });
}

void CNmtBedRoughnessDlg::DoDataExchange(Form& form) {
  listConstantOrMaps(form, "Bed roughness", item::kRoughnessHeight,
                     objectOf(&MudTransportParts::nmtBedRoughness), grid_);
}

}  // namespace gridbay
