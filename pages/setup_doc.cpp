#include "pages/setup_doc.h"

#include <algorithm>

#include "platform/files/paths.h"

namespace gridbay {

bool CV27SetupDoc::OnNewDocument() {
  setup_ = SetupFile(&host_);
  path_.clear();
  touched_.clear();
  modified_ = false;
  UpdateAllViews(nullptr);
  return true;
}

bool CV27SetupDoc::OnOpenDocument(const std::string& path) {
  Result<SetupFile> opened = SetupFile::open(path, &host_);
  if (!opened) {
    host_.show(opened.error());
    return false;
  }
  setup_ = std::move(*opened);
  path_ = path;
  touched_.clear();
  modified_ = false;
  UpdateAllViews(nullptr);
  return true;
}

bool CV27SetupDoc::OnSaveDocument(const std::string& path) {
  if (const Outcome saved = setup_.save(path); !saved) {
    host_.show(saved.error());
    return false;
  }
  path_ = path;
  modified_ = false;
  return true;
}

std::string CV27SetupDoc::getAbsoluteFilepath(const std::string& name) const {
  return absolutePath(name, path_.empty() ? std::string() : folderOfFile(path_));
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
