#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component_coefficients_page.h"
#include "advection_dispersion/page_texts.h"

namespace gridbay {

struct NadHeatDissipationWords {
  static constexpr FileKind kFile = texts::heatDissipationFile;
};

// A row for each component concerned.
class CNadHeatDissipationGrid final
    : public ComponentCoefficientsGrid<&AdvectionDispersionParts::nadHeatDissipation,
                                       NadHeatDissipationWords> {};

// How the heat of dissipating components is lost.
class CNadHeatDissipationDlg final
    : public ComponentCoefficientsDlg<18727, PageId::adHeatDissipation, CNadHeatDissipationGrid> {
 public:
  explicit CNadHeatDissipationDlg(CVdDoc& document);
  ~CNadHeatDissipationDlg() override;
};

}  // namespace gridbay
