#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/variable_headers.h"
#include "families/surface_values_page.h"

namespace gridbay {

// A row for each transported variable.
class CWQSADInfiltrationGridDlg final
    : public SurfaceValuesGrid<&EcologyParts::wqsAdInfiltration, ShownWqsVariables> {};

// The transported variables in the water that infiltrates.
class CWQSADInfiltrationDlg final
    : public SurfaceValuesDlg<18939, PageId::ecoInfiltration, &EcologyParts::wqsAdInfiltration,
                              CWQSADInfiltrationGridDlg> {
 public:
  explicit CWQSADInfiltrationDlg(CVdDoc& document);
  ~CWQSADInfiltrationDlg() override;
};

}  // namespace gridbay
