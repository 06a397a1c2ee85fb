#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/variable_headers.h"
#include "families/source_values_page.h"

namespace gridbay {

// A row for each source, a column for each variable.
class CWQSADSourceSinkGridDlg final
    : public NumberedVariableGrid<SourceValuesGrid<&EcologyParts::wqsAdSourceSink, NumberedWqsVariables>> {};

// The transported variables in the water of the sources.
class CWQSADSourceSinkDlg final
    : public SourceValuesDlg<18941, PageId::ecoSourceSink, CWQSADSourceSinkGridDlg> {
 public:
  explicit CWQSADSourceSinkDlg(CVdDoc& document);
  ~CWQSADSourceSinkDlg() override;
};

}  // namespace gridbay
