#include "pages/dialog.h"

#include "pages/grid_wnd.h"

namespace gridbay {

int CV27SetupDialog::DoModal() {
  for (Control& control : form_.controls()) {
    if (control.grid == nullptr) continue;
    control.grid->SetParentPage(this);
    control.grid->Initialize();
  }
  form_.SetDefaultHandler([this] {
    if (!form_.store(document_.units()).empty()) {
      form_.storeActing(document_.units());
    } else {
      form_.save();
    }
    Refresh();
  });
  form_.load();
  form_.show(document_.units());
  form_.applyRules();
  return editForm(document_.host(), title_, form_, picks_, [this] { return fault(); }) ? 1 : 0;
}

void CV27SetupDialog::AddPick(FieldPick pick) {
  pick.take = [this, take = std::move(pick.take)](std::span<const PickedPlace> places) {
    take(places);
    Refresh();
  };
  picks_.push_back(std::move(pick));
}

// A grid has changed the copy.
int CV27SetupDialog::UpdateDoc() {
  Refresh();
  return 1;
}

void CV27SetupDialog::Refresh() {
  form_.load();
  form_.show(document_.units(), true);
  form_.applyRules();
}

std::string CV27SetupDialog::fault() {
  std::string text = form_.store(document_.units());
  if (!text.empty()) return text;
  form_.save();
  return check_ ? check_() : std::string();
}

}  // namespace gridbay
