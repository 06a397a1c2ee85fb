#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/variable_headers.h"
#include "families/surface_values_page.h"

namespace gridbay {

// A row for each transported variable.
class CWQSADPrecipitationGridDlg final
    : public SurfaceValuesGrid<&EcologyParts::wqsAdPrecipitation, ShownWqsVariables> {};

// The transported variables in the water that rains.
class CWQSADPrecipitationDlg final
    : public SurfaceValuesDlg<18940, PageId::ecoPrecipitation, &EcologyParts::wqsAdPrecipitation,
                              CWQSADPrecipitationGridDlg> {
 public:
  explicit CWQSADPrecipitationDlg(CVdDoc& document);
  ~CWQSADPrecipitationDlg() override;
};

}  // namespace gridbay
