#include "families/data_files.h"

#include "basic/simulation_period.h"

namespace gridbay {

void requestSimulationPeriod(CVdFileSelectorDlg& selector, CKvsBase& object) {
  if (auto* basic = object.parts<BasicParts>(); basic != nullptr)
    basic->simulationPeriod->SetRequestPeriod(selector);
}

void requestMap(CVdFileSelectorDlg& selector, CKvsBase& object, int number, const Text& description,
                std::vector<int> itemTypes) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(description.format);
  request.SetMultiQunType(std::move(itemTypes));
  requestArea(request, object, number);
  requestForEngine(selector);
}

void requestForEngine(CVdFileSelectorDlg& selector) {
  selector.EnablePlugin(0);
  selector.SetVane27Compliant();
}

unsigned reportDataFile(ValidationList& messages, PageId page, const FileNameValue& file,
                        const std::string& why, Reason reason, Severity severity) {
  std::string text = formatted(texts::dataFileNotValid, file.text());
  if (reason == Reason::told) text += formatted(texts::errorMessage) + why;
  messages.push_back({page, std::move(text), severity});
  return 1;
}

unsigned checkDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                       const UTsbSelection& file, Reason reason, Severity severity) {
  std::string why;
  if (selector.IsTsbFileValid(file.fileName.absolute(), file.items, &why)) return 0;
  return reportDataFile(messages, page, file.fileName, why, reason, severity);
}

unsigned checkDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                       const FileNameValue& file, Reason reason, Severity severity) {
  std::string why;
  if (selector.IsTsbFileValid(file.absolute(), &why)) return 0;
  return reportDataFile(messages, page, file, why, reason, severity);
}

}  // namespace gridbay
