#include "setup/setup_doc.h"

#include <algorithm>
#include <utility>

#include "setup/setup_path.h"

namespace gridbay {

CV27SetupDoc::CV27SetupDoc(SetupHost& host) : CVdDoc(host), setup_(&host) {
  history_.start(root(), touched());
}

void CV27SetupDoc::start(SetupFile setup, const std::string& path, bool modified) {
  setup_ = std::move(setup);
  SetPath(path);
  touched().clear();
  SetModifiedFlag(modified);
  leavesOut_ = false;
  sources_.clear();
  history_.start(root(), touched());
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

bool CV27SetupDoc::mayLeaveOut() {
  if (leavesOut_) return true;
  const std::vector<std::string> unknown = setup_.unknownSections();
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
  if (!host().mayWriteOver(path) || !mayLeaveOut()) return false;
  history_.settle(root());
  const Outcome saved = setup_.save(path);
  const bool changed = history_.record(root(), PageId::none, "Save", false, touched());
  if (saved) {
    SetPath(path);
    SetModifiedFlag(false);
    history_.markSaved();
  } else {
    host().show(saved.error());
    if (changed) SetModifiedFlag();
  }
  if (changed) UpdateAllViews(nullptr);
  if (saved && saved_) saved_();
  return bool(saved);
}

unsigned CV27SetupDoc::ValidateData(ValidationList& messages) {
  unsigned faults = 0;
  history_.settle(root());
  try {
    faults = root().Validate(messages, 1);
  } catch (const std::exception& fault) {
    host().show("The check could not be finished: " + std::string(fault.what()));
    ++faults;
  }
  if (history_.record(root(), PageId::none, "Validation", false, touched())) SetModifiedFlag();
  UpdateAllViews(nullptr);
  return faults;
}

Outcome CV27SetupDoc::WriteRecoveryCopy(const std::string& copy) {
  try {
    return setup_.saveCopy(copy, path());
  } catch (const std::exception& fault) {
    return Failure{"The edits cannot be written: " + std::string(fault.what())};
  }
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

void CV27SetupDoc::ReplaceSource(KvsHandle source) {
  replaced_ = withValues(setup_.source(), nullptr, {});
  setup_.replaceSource(std::move(source));
}

void CV27SetupDoc::RecordEdit(PageId page, std::string name, bool continues) {
  const bool isRecorded =
      history_.record(root(), page, std::move(name), continues, touched(), replaced_ != nullptr);
  if (isRecorded && replaced_ != nullptr) {
    std::erase_if(sources_, [this](const SourceChange& each) { return !history_.hasState(each.state); });
    sources_.push_back({history_.state(), std::move(replaced_)});
  }
}

void CV27SetupDoc::exchangeSource(std::uint64_t state) {
  const auto change = std::ranges::find(sources_, state, &SourceChange::state);
  if (change == sources_.end()) return;
  KvsHandle now = withValues(setup_.source(), nullptr, {});
  setup_.replaceSource(std::exchange(change->other, std::move(now)));
}

void CV27SetupDoc::Undo() {
  const std::uint64_t before = history_.state();
  history_.undo(root(), touched());
  if (history_.state() != before) exchangeSource(before);
  SetModifiedFlag(!history_.isSaved());
  UpdateAllViews(nullptr);
}

void CV27SetupDoc::Redo() {
  const std::uint64_t before = history_.state();
  history_.redo(root(), touched());
  if (history_.state() != before) exchangeSource(history_.state());
  SetModifiedFlag(!history_.isSaved());
  UpdateAllViews(nullptr);
}

}  // namespace gridbay
