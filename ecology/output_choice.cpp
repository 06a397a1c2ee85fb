#include "ecology/output_choice.h"

#include "ecology/model_definition.h"

namespace gridbay {
namespace {

const std::string& nameOf(const CSolverItem& item) {
  return item.symbol.empty() ? item.description : item.symbol;
}

}  // namespace

std::vector<std::string> stateVariableNames(CKvsBase& object) {
  std::vector<std::string> names;
  if (const CWQSModelDefinitionKvs* model = modelDefinitionOf(object); model != nullptr) {
    for (const CSolverItem& variable : model->stateVariables()) names.push_back(nameOf(variable));
  }
  return names;
}

std::vector<std::string> additionalItemNames(CKvsBase& object) {
  std::vector<std::string> names;
  if (const CWQSModelDefinitionKvs* model = modelDefinitionOf(object); model != nullptr) {
    for (const CSolverItem* item : model->outputItems()) names.push_back(nameOf(*item));
  }
  return names;
}

int stateVariableCount(CKvsBase& object) {
  const CWQSModelDefinitionKvs* model = modelDefinitionOf(object);
  return model == nullptr ? 0 : model->GetNoStateVariables();
}

int additionalItemCount(CKvsBase& object) {
  const CWQSModelDefinitionKvs* model = modelDefinitionOf(object);
  return model == nullptr ? 0 : static_cast<int>(model->outputItems().size());
}

}  // namespace gridbay
