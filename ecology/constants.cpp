#include "ecology/constants.h"

#include "ecology/texts.h"
#include "ecology/transported.h"

namespace gridbay {

void CWQSConstantsItemKvs::SetNoAreas(int areas) {
  if (areas >= 0) files.resize(static_cast<std::size_t>(areas), UTsbSelection(1));
}

UTsbSelection* CWQSConstantsItemKvs::File(int area) {
  const bool isThere = area >= 1 && area <= static_cast<int>(files.size());
  return isThere ? &files[static_cast<std::size_t>(area) - 1] : nullptr;
}

unsigned CWQSConstantsItemKvs::Validate(ValidationList& messages, int, int position) {
  const CSolverItem* declared = Declaration();
  if (IsConstant()) {
    if (declared == nullptr || declared->IsInRange(value)) return 0;
    return report(messages, PageId::ecoConstants, Severity::fault, texts::numberOutOfRange, position);
  }
  unsigned faults = 0;
  for (int area = 1; faults == 0 && area <= static_cast<int>(files.size()); ++area) {
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, area);
    faults = checkDataFile(messages, PageId::ecoConstants, selector, *File(area));
  }
  return faults;
}

void CWQSConstantsItemKvs::RequestDataFile(CVdFileSelectorDlg& selector, int area) {
  requestDeclared(selector, texts::constantsRequest, Declaration());
  requestArea(selector, *this, area);
  requestForEngine(selector);
}

void CWQSConstantsItemKvs::FilesRow::save(const CWQSConstantsItemKvs& item, KvsFile& file,
                                          const std::string& documentPath) const {
  NumberedText name(kArea);
  int area = 0;
  for (const UTsbSelection& selection : item.files) {
    kvsAddSection(file, name.of(++area));
    selection.Save(file, documentPath);
    kvsEndSection(file);
  }
}

void CWQSConstantsItemKvs::FilesRow::load(CWQSConstantsItemKvs& item, KvsSection from,
                                          const std::string& documentPath) const {
  NumberedText name(kArea);
  int area = 0;
  for (UTsbSelection& selection : item.files) {
    const KvsSection section = kvsSectionByNameNum(from, name.of(++area), 1);
    if (section != nullptr) selection.Load(section, documentPath, 1);
  }
}

bool CWQSConstantsItemKvs::FilesRow::access(CWQSConstantsItemKvs& item, std::string_view path,
                                            PathAccess& access) const {
  const PathStep step = stepOf(path);
  const std::optional<int> area = numberIn(step.first, kArea);
  UTsbSelection* selection = area ? item.File(*area) : nullptr;
  if (selection == nullptr) return false;
  if (!step.isLast()) return selection->Access(step.rest, access);
  access.isSection = true;
  if (access.what == PathAccess::What::write) {
    kvsAddSection(*access.out, formatted(kArea, *area));
    selection->Save(*access.out, *access.documentPath);
    kvsEndSection(*access.out);
  }
  return true;
}

}  // namespace gridbay
