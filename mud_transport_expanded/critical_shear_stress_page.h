#pragma once

#include <string>

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/critical_shear_stress.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {

struct NmtExpCriticalShearStressWords {
  static std::string band(int layer) { return formatted(texts::layerEntry, layer); }
  static constexpr FileKind kFile = texts::bed::criticalShearStressFile;
};

// A band for each layer.
class CNmtExpCriticalShearStressGrid final
    : public AreaMapBands<&MudTransportExpandedParts::nmtExpCriticalShearStress,
                          NmtExpCriticalShearStressWords> {};

// Above which shear stress the layers of the bed erode.
class CNmtExpCriticalShearStressDlg final : public Page<18842, PageId::mtExpCriticalShearStress> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Critical shear stress", grid_); }

  CNmtExpCriticalShearStressGrid grid_;
};

}  // namespace gridbay
