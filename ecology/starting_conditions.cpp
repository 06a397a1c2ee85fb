#include "ecology/starting_conditions.h"

#include "ecology/model_definition.h"

namespace gridbay {
namespace {

constexpr int kHotStartDataType = 2;

}  // namespace

void CWQSStartingConditionsGridItemKvs::RequestFile(CVdFileSelectorDlg& selector, int number) {
  const CWQSModelDefinitionKvs* model = modelDefinitionOf(*this);
  requestArea(selector, *this, number);
  selector.SetDataType(kHotStartDataType);
  selector.SetNoItems(model == nullptr ? 0 : model->GetNoStateVariables());
  selector.SetVane27Compliant();
}

unsigned CWQSStartingConditionsGridItemKvs::Validate(ValidationList& messages, int, int number) {
  CVdFileSelectorDlg selector;
  RequestFile(selector, number);
  return checkDataFile(messages, PageId::ecoStartingConditions, selector, file, Reason::left,
                       Severity::dependedUpon);
}

}  // namespace gridbay
