#include "pages/setup_doc.h"

#include <algorithm>

#include "core/letters.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "platform/files/paths.h"

namespace gridbay {

CV27SetupDoc::CV27SetupDoc(SetupHost& host) : host_(host), setup_(&host) {
  history_.start(root(), path_, touched_);
}

void CV27SetupDoc::start(SetupFile setup, const std::string& path, bool modified) {
  setup_ = std::move(setup);
  path_ = path;
  touched_.clear();
  modified_ = modified;
  leavesOut_ = false;
  history_.start(root(), path_, touched_);
  if (modified) history_.markUnsaved();
  UpdateAllViews(nullptr);
}

bool CV27SetupDoc::OnNewDocument() {
  start(SetupFile(&host_), {}, false);
  return true;
}

bool CV27SetupDoc::OnOpenDocument(const std::string& path) {
  Result<SetupFile> opened = SetupFile::open(path, &host_);
  if (!opened) {
    host_.show(opened.error());
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
  leavesOut_ = host_.askYesNo(question + "\n\nSave without it?");
  return leavesOut_;
}

bool CV27SetupDoc::OnSaveDocument(const std::string& path) {
  if (!host_.mayWriteOver(path) || !mayLeaveOut(path)) return false;
  if (const Outcome saved = setup_.save(path); !saved) {
    host_.show(saved.error());
    return false;
  }
  path_ = path;
  modified_ = false;
  history_.markSaved();
  if (saved_) saved_();
  return true;
}

Outcome CV27SetupDoc::WriteRecoveryCopy(const std::string& copy) {
  return setup_.saveCopy(copy, path_);
}

bool CV27SetupDoc::OnRecoverDocument(const std::string& copy, const std::string& path) {
  Result<SetupFile> opened = SetupFile::open(copy, &host_, path);
  if (!opened) {
    host_.show(opened.error());
    return false;
  }
  start(std::move(*opened), path, true);
  return true;
}

void CV27SetupDoc::RecordEdit(PageId page, std::string name, bool continues) {
  history_.record(root(), page, std::move(name), continues, touched_);
}

void CV27SetupDoc::Undo() {
  history_.undo(root(), touched_);
  modified_ = !history_.isSaved();
  UpdateAllViews(nullptr);
}

void CV27SetupDoc::Redo() {
  history_.redo(root(), touched_);
  modified_ = !history_.isSaved();
  UpdateAllViews(nullptr);
}

std::string CV27SetupDoc::getAbsoluteFilepath(const std::string& name) const {
  return absolutePath(name, path_.empty() ? std::string() : folderOfFile(path_));
}

void CV27SetupDoc::EnableMultiToolTips(CV27SetupFormView& page, std::string_view label,
                                       std::string_view text) {
  if (Control* control = page.form().find(label)) control->toolTip = text;
}

void CV27SetupDoc::EnableGXMultiToolTips(CV27SetupGridWnd& grid, int column) {
  grid.EnableGridToolTips(column);
}

std::string CV27SetupDoc::GetToolTipsString(std::string_view value) {
  constexpr std::size_t kLine = 100;
  return onLines(value, kLine);
}

void CV27SetupDoc::AddView(const void* owner, View update) {
  views_.emplace_back(owner, std::move(update));
}

void CV27SetupDoc::RemoveView(const void* owner) {
  std::erase_if(views_, [owner](const auto& view) { return view.first == owner; });
}

void CV27SetupDoc::UpdateAllViews(const void* sender) {
  // A view may go, and another come, while it is told.
  const auto views = views_;
  for (const auto& [owner, update] : views) {
    const bool stillThere =
        std::ranges::any_of(views_, [o = owner](const auto& view) { return view.first == o; });
    if (owner != sender && stillThere) update();
  }
}

}  // namespace gridbay
