#pragma once

#include "ecology/ecology_parts.h"
#include "families/dispersion_page.h"

namespace gridbay {

// A row for each area.
using CWQSADDispersionGridDlg = DispersionCoefGrid<&EcologyParts::wqsAdDispersion>;

// The dispersion of all transported variables.
class CWQSADDispersionDlg final
    : public DispersionCoefDlg<18938, PageId::ecoDispersion, &EcologyParts::wqsAdDispersion> {
 public:
  explicit CWQSADDispersionDlg(CVdDoc& document);
  ~CWQSADDispersionDlg() override;
};

}  // namespace gridbay
