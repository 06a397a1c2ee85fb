#include "ecology/initial_conditions_page.h"

#include "ecology/ecology_parts.h"
#include "ecology/page_texts.h"
#include "ecology/transport_page_texts.h"
#include "ecology/variable_headers.h"

namespace gridbay {

int CWQSInitialConditionsGridDlg::EntryCount() {
  return parts<EcologyParts>().wqsInitialConditions->GetCount();
}

CWQSInitialConditionsStateVariableKvs* CWQSInitialConditionsGridDlg::EntryAt(int number) {
  return parts<EcologyParts>().wqsInitialConditions->GetItem(number);
}

std::string CWQSInitialConditionsGridDlg::BandTitle(int item) {
  return formatted(texts::variableBand, WqsVariables::name(GetKvs(), item));
}

int CWQSInitialConditionsGridDlg::Quantity(int number) {
  return WqsVariables::quantity(GetKvs(), number);
}

std::string CWQSInitialConditionsGridDlg::ValueTip(int number) {
  return rangeTip(WqsVariables::declaration(GetKvs(), number), document().units());
}

std::string CWQSInitialConditionsGridDlg::UnitOf(int number) {
  return unitText(WqsVariables::declaration(GetKvs(), number), document().units());
}

Choices CWQSInitialConditionsGridDlg::Formats() {
  return Choices::lines("Constant value\r\nType 2 data file\r\n");
}

FileKind CWQSInitialConditionsGridDlg::KindOfFile(std::int32_t) {
  return texts::type2File;
}

}  // namespace gridbay
