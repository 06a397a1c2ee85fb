#include "ecology/forcings.h"

#include "core/table_code.h"
#include "ecology/texts.h"
#include "ecology/transported.h"

namespace gridbay {

bool CWQSForcingsItemKvs::fits(KvsSection section) const {
  const CSolverItem* declared = Declaration();
  if (declared == nullptr) return false;
  std::int32_t id = declared->id;
  bool isUser = declared->userSpecified;
  std::int32_t variation = declared->spatialVariation;
  kvsGetParam(section, "ID", &id, 1, 1);
  kvsGetParam(section, "User_Specified", &isUser, 1, 1);
  kvsGetParam(section, "Spatial_Variation", &variation, 1, 1);
  return id == declared->id && isUser == declared->userSpecified && variation == declared->spatialVariation;
}

void CWQSForcingsItemKvs::Load(KvsSection section, const std::string& documentPath) {
  if (fits(section)) GivenItemKvs::Load(section, documentPath);
}

unsigned CWQSForcingsItemKvs::Validate(ValidationList& messages, int, int position) {
  if (!IsConstant()) {
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, position);
    return checkDataFile(messages, PageId::ecoForcings, selector, file);
  }
  const CSolverItem* declared = Declaration();
  if (declared == nullptr || !declared->HasLimits() || declared->IsInRange(value)) return 0;
  return report(messages, PageId::ecoForcings, Severity::fault, texts::numberOutOfRange, position);
}

// The dimension of the file follows from the format.
void CWQSForcingsItemKvs::RequestDataFile(CVdFileSelectorDlg& selector, int) {
  requestDeclared(selector, texts::forcingsRequest, Declaration());
  selector.SetDimensions(format - 1);
  requestSimulationPeriod(selector, *this);
  if (format == kMap) selector.AllowOneTimeStep();
  requestForEngine(selector);
}

}  // namespace gridbay
