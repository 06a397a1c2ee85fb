#include "ecology/initial_conditions.h"

#include "ecology/texts.h"

namespace gridbay {

unsigned CWQSInitialConditionsItemKvs::Validate(ValidationList& messages, int, int variable, int area) {
  if (format == kConstant) {
    const std::string place = formatted(texts::variableInArea, WqsVariables::name(*this, variable), area);
    return checkRange(messages, PageId::ecoInitialConditions, WqsVariables::declaration(*this, variable),
                      value, place);
  }
  if (format != kMap) return 0;
  CVdFileSelectorDlg selector;
  RequestDataFile(selector, variable, area);
  return checkDataFile(messages, PageId::ecoInitialConditions, selector, file);
}

void CWQSInitialConditionsItemKvs::RequestDataFile(CVdFileSelectorDlg& selector, int variable, int area) {
  requestDeclared(selector, texts::initialConditionsRequest, WqsVariables::declaration(*this, variable));
  requestArea(selector, *this, area);
  requestForEngine(selector);
}

void CWQSInitialConditionsKvs::initialise(CWQSInitialConditionsStateVariableKvs& entry, int number) {
  entry.variable = number;
  entry.SetCount(areaCount(*this));
}

void CWQSInitialConditionsKvs::Rebuild() {
  SetCount(0);
  SetCount(WqsVariables::count(*this));
}

CWQSInitialConditionsKvs::Found CWQSInitialConditionsKvs::Find(int variable, int area) {
  auto* entry = GetItem(variable);
  auto* item = entry == nullptr ? nullptr : entry->GetItem(area);
  if (item == nullptr) return {};
  return {item, WqsVariables::declaration(*this, variable)};
}

}  // namespace gridbay
