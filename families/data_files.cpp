#include "families/data_files.h"

#include <algorithm>
#include <cstdlib>

#include "basic/simulation_period.h"

namespace gridbay {
namespace {

constexpr int kNotAlongAnAxis = -1;

}  // namespace

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

void requestVaryingMap(CVdFileSelectorDlg& selector, CKvsBase& object, int number, const Text& description,
                       int itemType) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(description.format);
  request.SetQunType(itemType);
  requestArea(request, object, number);
  requestSimulationPeriod(selector, object);
  selector.AllowOneTimeStep();
  requestForEngine(selector);
}

void requestTimeSeries(CVdFileSelectorDlg& selector, CKvsBase& object, const Text& description,
                       int itemType) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(description.format);
  request.SetQunType(itemType);
  request.SetDimensions(0);
  requestSimulationPeriod(selector, object);
  requestForEngine(selector);
}

int pointsAlong(const CBoundaryObjectKvs& boundary) {
  if (boundary.first.j == boundary.last.j) return boundary.last.k - boundary.first.k + 1;
  return boundary.first.k == boundary.last.k ? boundary.last.j - boundary.first.j + 1 : kNotAlongAnAxis;
}

int pointsByExtent(const CBoundaryObjectKvs& boundary) {
  if (boundary.first.j != boundary.last.j && boundary.first.k != boundary.last.k) return kNotAlongAnAxis;
  return std::max(std::abs(boundary.last.j - boundary.first.j),
                  std::abs(boundary.last.k - boundary.first.k)) +
         1;
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

void noteDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                  const FileNameValue& file, const std::vector<std::uint32_t>& items) {
  messages.files.push_back({page, file.text(), file.absolute(), items, selector.requestsPeriod()});
}

unsigned checkDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                       const UTsbSelection& file, Reason reason, Severity severity) {
  noteDataFile(messages, page, selector, file.fileName, file.items);
  std::string why;
  if (selector.IsTsbFileValid(file.fileName.absolute(), file.items, &why)) return 0;
  return reportDataFile(messages, page, file.fileName, why, reason, severity);
}

unsigned checkDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                       const FileNameValue& file, Reason reason, Severity severity) {
  noteDataFile(messages, page, selector, file);
  std::string why;
  if (selector.IsTsbFileValid(file.absolute(), &why)) return 0;
  return reportDataFile(messages, page, file, why, reason, severity);
}

}  // namespace gridbay
