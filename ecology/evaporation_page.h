#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/variable_headers.h"
#include "families/surface_values_page.h"

namespace gridbay {

// A row for each transported variable.
class CWQSADEvaporationGridDlg final
    : public SurfaceValuesGrid<&EcologyParts::wqsAdEvaporation, ShownWqsVariables> {};

// The transported variables in the water that evaporates.
class CWQSADEvaporationDlg final
    : public SurfaceValuesDlg<18939, PageId::ecoEvaporation, &EcologyParts::wqsAdEvaporation,
                              CWQSADEvaporationGridDlg> {
 public:
  explicit CWQSADEvaporationDlg(CVdDoc& document);
  ~CWQSADEvaporationDlg() override;
};

}  // namespace gridbay
