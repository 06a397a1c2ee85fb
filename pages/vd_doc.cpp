#include "pages/vd_doc.h"

#include <algorithm>

#include "core/letters.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "platform/files/paths.h"

namespace gridbay {

std::string CVdDoc::getAbsoluteFilepath(const std::string& name) const {
  return absolutePath(name, path_.empty() ? std::string() : folderOfFile(path_));
}

void CVdDoc::EnableMultiToolTips(CV27SetupFormView& page, std::string_view label, std::string_view text) {
  if (Control* control = page.form().find(label)) control->toolTip = text;
}

void CVdDoc::EnableGXMultiToolTips(CV27SetupGridWnd& grid, int column) {
  grid.EnableGridToolTips(column);
}

std::string CVdDoc::GetToolTipsString(std::string_view value) {
  constexpr std::size_t kLine = 100;
  return onLines(value, kLine);
}

bool CVdDoc::Attempt(const std::function<void()>& edit) {
  try {
    edit();
    return true;
  } catch (const std::exception& fault) {
    TakeBackUnrecorded();
    UpdateAllViews(nullptr);
    host_.show("The edit could not be made, and the setup is as it was before: " + std::string(fault.what()));
    return false;
  }
}

void CVdDoc::AddView(const void* owner, View update) {
  views_.emplace_back(owner, std::move(update));
}

void CVdDoc::RemoveView(const void* owner) {
  std::erase_if(views_, [owner](const auto& view) { return view.first == owner; });
}

void CVdDoc::UpdateAllViews(const void* sender) {
  // A view may go, and another come, while it is told.
  const auto views = views_;
  for (const auto& [owner, update] : views) {
    const bool stillThere =
        std::ranges::any_of(views_, [o = owner](const auto& view) { return view.first == o; });
    if (owner != sender && stillThere) update();
  }
}

}  // namespace gridbay
