#include "ecology/transported.h"

#include "core/string_table.h"
#include "ecology/model_definition.h"
#include "ecology/texts.h"

namespace gridbay {

int WqsVariables::count(CKvsBase& object) {
  const CWQSModelDefinitionKvs* model = modelDefinitionOf(object);
  return model == nullptr ? 0 : model->GetNoTransported();
}

const CSolverItem* WqsVariables::declaration(CKvsBase& object, int entry) {
  const CWQSModelDefinitionKvs* model = modelDefinitionOf(object);
  return model == nullptr ? nullptr : model->Transported(entry);
}

std::string WqsVariables::name(CKvsBase& object, int entry) {
  const CSolverItem* declared = declaration(object, entry);
  return declared == nullptr ? std::string() : declared->symbol;
}

int WqsVariables::quantity(CKvsBase& object, int entry) {
  const CSolverItem* declared = declaration(object, entry);
  return declared == nullptr ? 0 : declared->Quantity();
}

int WqsVariables::id(CKvsBase& object, int entry) {
  const CSolverItem* declared = declaration(object, entry);
  return declared == nullptr ? 0 : declared->id;
}

double WqsVariables::defaultValue(CKvsBase& object, int entry) {
  const CSolverItem* declared = declaration(object, entry);
  return declared == nullptr ? 0 : declared->defaultValue;
}

void WqsVariables::requestItems(CVdFileSelectorDlg& selector, CKvsBase& object) {
  const int variables = count(object);
  selector.SetNoItems(variables);
  for (int entry = 1; entry <= variables; ++entry) {
    const std::string symbol = name(object, entry);
    requestDeclared(selector, Text{symbol}, declaration(object, entry));
  }
}

void requestDeclared(CVdFileSelectorDlg& selector, const Text& description, const CSolverItem* declared) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(description.format);
  if (declared != nullptr && declared->Quantity() != 0) request.SetQunType(declared->Quantity());
}

unsigned checkRange(ValidationList& messages, PageId page, const CSolverItem* declared, double value,
                    const std::string& place) {
  if (declared == nullptr || declared->IsInRange(value)) return 0;
  return report(messages, page, Severity::fault, texts::valueOutOfRange, place);
}

}  // namespace gridbay
