#pragma once

#include <string>

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/erosion_coefficient.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {

struct NmtExpErosionCoefficientWords {
  static std::string band(int layer) { return formatted(texts::layerEntry, layer); }
  static constexpr FileKind kFile = texts::bed::erosionCoefficientFile;
};

// A band for each layer.
class CNmtExpErosionCoefficientGrid final
    : public AreaMapBands<&MudTransportExpandedParts::nmtExpErosionCoefficient,
                          NmtExpErosionCoefficientWords> {};

// How much of the layers of the bed erodes.
class CNmtExpErosionCoefficientDlg final : public Page<18848, PageId::mtExpErosionCoefficient> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Erosion coefficient", grid_); }

  CNmtExpErosionCoefficientGrid grid_;
};

}  // namespace gridbay
