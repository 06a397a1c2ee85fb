#pragma once

#include <string>

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/deposition.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {

struct NmtExpShearStressWords {
  static std::string band(int fraction) { return formatted(texts::fractionEntry, fraction); }
  static constexpr FileKind kFile = texts::bed::criticalShearStressFile;
};

// A band for each fraction.
class CNmtExpShearStressGrid final
    : public AreaMapBands<&MudTransportExpandedParts::nmtExpDeposition, NmtExpShearStressWords> {};

// The profile of the sediment, and below which shear stress the fractions settle.
class CNmtExpDepositionDlg final : public Page<18844, PageId::mtExpDeposition> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpShearStressGrid grid_;
};

}  // namespace gridbay
