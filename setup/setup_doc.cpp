#include "setup/setup_doc.h"

#include <algorithm>

namespace gridbay {

CV27SetupDoc::CV27SetupDoc(SetupHost& host) : CVdDoc(host), setup_(&host) {
  history_.start(root(), path(), touched());
}

void CV27SetupDoc::start(SetupFile setup, const std::string& path, bool modified) {
  setup_ = std::move(setup);
  SetPath(path);
  touched().clear();
  SetModifiedFlag(modified);
  leavesOut_ = false;
  history_.start(root(), path, touched());
  if (modified) history_.markUnsaved();
  UpdateAllViews(nullptr);
}

bool CV27SetupDoc::OnNewDocument() {
  start(SetupFile(&host()), {}, false);
  return true;
}

bool CV27SetupDoc::OnOpenDocument(const std::string& path) {
  Result<SetupFile> opened = SetupFile::open(path, &host());
  if (!opened) {
    host().show(opened.error());
    return false;
  }
  start(std::move(*opened), path, false);
  return true;
}

bool CV27SetupDoc::mayLeaveOut(const std::string& path) {
  if (leavesOut_) return true;
  const std::vector<std::string> unknown = setup_.unknownSections(path);
  if (unknown.empty()) return true;
  constexpr std::size_t kMost = 10;
  std::string question =
      "This version does not know some of what the file holds, and a save leaves it out:\n";
  for (std::size_t i = 0; i < std::min(kMost, unknown.size()); ++i) question += "\n" + unknown[i];
  if (unknown.size() > kMost) question += "\nand " + std::to_string(unknown.size() - kMost) + " more";
  leavesOut_ = host().askYesNo(question + "\n\nSave without it?");
  return leavesOut_;
}

bool CV27SetupDoc::OnSaveDocument(const std::string& path) {
  if (!mayLeaveOut(path)) return false;
  if (const Outcome saved = setup_.save(path); !saved) {
    host().show(saved.error());
    return false;
  }
  SetPath(path);
  SetModifiedFlag(false);
  history_.markSaved();
  return true;
}

Outcome CV27SetupDoc::WriteRecoveryCopy(const std::string& copy) {
  return setup_.saveCopy(copy, path());
}

bool CV27SetupDoc::OnRecoverDocument(const std::string& copy, const std::string& path) {
  Result<SetupFile> opened = SetupFile::open(copy, &host(), path);
  if (!opened) {
    host().show(opened.error());
    return false;
  }
  start(std::move(*opened), path, true);
  return true;
}

void CV27SetupDoc::RecordEdit(PageId page, std::string name, bool continues) {
  history_.record(root(), page, std::move(name), continues, touched());
}

void CV27SetupDoc::Undo() {
  history_.undo(root(), touched());
  SetModifiedFlag(!history_.isSaved());
  UpdateAllViews(nullptr);
}

void CV27SetupDoc::Redo() {
  history_.redo(root(), touched());
  SetModifiedFlag(!history_.isSaved());
  UpdateAllViews(nullptr);
}

}  // namespace gridbay
