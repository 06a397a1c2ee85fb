#pragma once

#include "families/area_maps_page.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/var_friction_coef.h"

namespace gridbay {

struct NmtExpVarFrictionCoefWords {
  static constexpr FileKind kFile = texts::bed::frictionCoefficientFile;
};

// A row for each area.
class CNmtExpVarFrictionCoefGrid final
    : public AreaMapRows<&MudTransportExpandedParts::nmtExpVarFrictionCoef, NmtExpVarFrictionCoefWords> {};

// How mud slides where the coefficient varies.
class CNmtExpVarFrictionCoefDlg final : public Page<18866, PageId::mtExpVarFrictionCoef> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtExpVarFrictionCoefGrid grid_;
};

}  // namespace gridbay
