#include "ecology/deposition.h"

#include "ecology/texts.h"

namespace gridbay {

unsigned CWQSADDepositionItemKvs::Validate(ValidationList& messages, int, int variable, int area,
                                           const Text& whose) {
  if (format == kConstant) {
    return checkRange(messages, PageId::ecoDeposition, WqsVariables::declaration(*this, variable), value,
                      formatted(whose, WqsVariables::name(*this, variable)));
  }
  if (format != kMap) return 0;
  CVdFileSelectorDlg selector;
  RequestDataFile(selector, variable, area);
  return checkDataFile(messages, PageId::ecoDeposition, selector, file);
}

void CWQSADDepositionItemKvs::RequestDataFile(CVdFileSelectorDlg& selector, int variable, int area) {
  requestDeclared(selector, texts::initialConditionsRequest, WqsVariables::declaration(*this, variable));
  requestArea(selector, *this, area);
  requestSimulationPeriod(selector, *this);
  selector.AllowOneTimeStep();
  requestForEngine(selector);
}

void CWQSADDepositionKvs::Rebuild() {
  SetCount(0);
  SetCount(WqsVariables::count(*this));
}

}  // namespace gridbay
