#pragma once

#include <string>

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/numbered_grid.h"
#include "mud_transport_expanded/settling_par.h"
#include "mud_transport_expanded/texts.h"

namespace gridbay {

struct NmtExpFallVelocityWords {
  static std::string band(int fraction) { return formatted(texts::fractionEntry, fraction); }
  static constexpr FileKind kFile = texts::bed::fallVelocityFile;
};

// A band for each fraction, with its velocity; with flocculation the coefficient, which has no unit.
class CNmtExpFallVelocityGrid final
    : public AreaMapBands<&MudTransportExpandedParts::nmtExpSettlingPar, NmtExpFallVelocityWords> {
  int Quantity(int number) override;
};

// A row for each fraction, with its exponents.
class CNmtExpSettlingParGrid final : public FractionGrid {
  void LayOut() override;
};

// How the fractions settle.
class CNmtExpSettlingParDlg final : public Page<18859, PageId::mtExpSettlingPar> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpFallVelocityGrid velocities_;
  CNmtExpSettlingParGrid exponents_;
};

}  // namespace gridbay
