#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component_coefficients_page.h"
#include "advection_dispersion/page_texts.h"

namespace gridbay {

struct NadDecaySpecificationWords {
  static constexpr FileKind kFile = texts::decayFile;
};

// A row for each component concerned.
class CNadDecaySpecificationGrid final
    : public ComponentCoefficientsGrid<&AdvectionDispersionParts::nadDecaySpecification,
                                       NadDecaySpecificationWords> {};

// How the decaying components decay.
class CNadDecaySpecificationDlg final
    : public ComponentCoefficientsDlg<18721, PageId::adDecaySpecification, CNadDecaySpecificationGrid> {
 public:
  explicit CNadDecaySpecificationDlg(CVdDoc& document);
  ~CNadDecaySpecificationDlg() override;
};

}  // namespace gridbay
