#pragma once

#include <string>

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/const_friction_coef.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {

struct NmtExpConstFrictionCoefWords {
  static std::string band(int layer) { return formatted(texts::layerEntry, layer); }
  static constexpr FileKind kFile = texts::bed::frictionCoefficientFile;
};

// A band for each layer.
class CNmtExpConstFrictionCoefGrid final
    : public AreaMapBands<&MudTransportExpandedParts::nmtExpConstFrictionCoef, NmtExpConstFrictionCoefWords> {
};

// How the layers of the bed slide.
class CNmtExpConstFrictionCoefDlg final : public Page<18841, PageId::mtExpConstFrictionCoef> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Constant friction coefficient", grid_); }

  CNmtExpConstFrictionCoefGrid grid_;
};

}  // namespace gridbay
