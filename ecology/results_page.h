#pragma once

#include "ecology/ecology_parts.h"
#include "ecology/results.h"
#include "ecology/transport_page_texts.h"
#include "families/transport_results_page.h"

namespace gridbay {

// A row for each output.
class CWQSResultsGridDlg final : public TransportOutputColumns {
  void LayOut() override;
};
using CWQSResultsHotStartGridDlg =
    ResultHotStartGrid<&EcologyParts::wqsResults, texts::wqsHotStartResultFile>;

// The outputs and hot start files of the module.
class CWQSResultsDlg final : public Page<18948, PageId::ecoResults> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CWQSResultsGridDlg outputs_;
  CWQSResultsHotStartGridDlg hotStarts_;
};

}  // namespace gridbay
