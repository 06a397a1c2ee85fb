#pragma once

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/bed_roughness.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"

namespace gridbay {

struct NmtExpBedRoughnessWords {
  static constexpr FileKind kFile = texts::bed::roughnessFile;
};

// A row for each area.
class CNmtExpBedRoughnessGrid final
    : public AreaMapRows<&MudTransportExpandedParts::nmtExpBedRoughness, NmtExpBedRoughnessWords> {};

// How rough the bed is.
class CNmtExpBedRoughnessDlg final : public Page<18839, PageId::mtExpBedRoughness> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Bed roughness", grid_); }

  CNmtExpBedRoughnessGrid grid_;
};

}  // namespace gridbay
