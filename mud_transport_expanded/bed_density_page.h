#pragma once

#include <string>

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_density.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {

struct NmtExpBedDensityWords {
  static std::string band(int layer) { return formatted(texts::layerEntry, layer); }
  static constexpr FileKind kFile = texts::bed::densityFile;
};

// A band for each layer.
class CNmtExpBedDensityGrid final
    : public AreaMapBands<&MudTransportExpandedParts::nmtExpBedDensity, NmtExpBedDensityWords> {};

// How dense the layers of the bed are.
class CNmtExpBedDensityDlg final : public Page<18843, PageId::mtExpBedDensity> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Density of bed layer", grid_); }

  CNmtExpBedDensityGrid grid_;
};

}  // namespace gridbay
