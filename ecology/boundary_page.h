#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/variable_headers.h"
#include "families/boundary_values_page.h"

namespace gridbay {

// How the transported variables at each boundary are given.
class CWQSADBoundaryGridDlg final
    : public BoundaryValuesGrid<&EcologyParts::wqsAdBoundary, NumberedWqsVariables> {};

// Variable by boundary.
class CWQSADBoundaryConstantsGridDlg final
    : public NumberedVariableGrid<BoundaryConstantsGrid<&EcologyParts::wqsAdBoundary, NumberedWqsVariables>> {
};

// The transported variables at the open boundaries.
class CWQSADBoundaryDlg final : public BoundaryValuesDlg<18936, PageId::ecoBoundary, CWQSADBoundaryGridDlg,
                                                         CWQSADBoundaryConstantsGridDlg> {
 public:
  explicit CWQSADBoundaryDlg(CVdDoc& document);
  ~CWQSADBoundaryDlg() override;
};

}  // namespace gridbay
