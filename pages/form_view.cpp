#include "pages/form_view.h"

#include <algorithm>

#include "pages/grid_wnd.h"

namespace gridbay {

FileField& FileField::EnabledIf(const Control::Rule& rule) {
  edit.EnabledIf(rule);
  browse.EnabledIf(rule);
  view.EnabledIf([rule, exists = view.enabledIf] { return rule() && (!exists || exists()); });
  return *this;
}

FileField& FileField::VisibleIf(const Control::Rule& rule) {
  for (Control* control : {&edit, &browse, &view}) control->VisibleIf(rule);
  return *this;
}

CV27SetupFormView::CV27SetupFormView(CVdDoc& document, std::int32_t templateId, PageId pageId)
    : document_(document), templateId_(templateId), pageId_(pageId) {}

CV27SetupFormView::~CV27SetupFormView() {
  document_.RemoveView(this);
}

void CV27SetupFormView::OnInitialUpdate() {
  form_.SetDefaultHandler([this] {
    if (UpdateDoc() == 0) EnableControls();
  });
  form_.SetGuard([this](const std::function<void()>& edit) { document_.Attempt(edit); });
  DoDataExchange(form_);
  for (Control& control : form_.controls()) {
    if (control.grid == nullptr) continue;
    control.grid->SetParentPage(this);
    control.grid->Initialize();
  }
  Initialize();
  document_.AddView(this, [this] { OnUpdate(); });
  SetData();
}

int CV27SetupFormView::GetData() {
  if (!UpdateData(true)) return 0;
  form_.save();
  return 1;
}

void CV27SetupFormView::SetData() {
  form_.load();
  UpdateData(false);
  EnableControls();
}

int CV27SetupFormView::UpdateDoc() {
  const Control* acting = form_.acting();
  // What a grid or a button has changed is in the model already, and newer than what the controls say.
  const bool isInModel = !editName_.empty() || (acting != nullptr && acting->kind == ControlKind::button);
  if (isInModel) Refresh();
  const bool isWhole = GetData() != 0;
  if (!isWhole && !isInModel && !form_.storeActing(document_.units())) return 0;
  document_.Touch(pageId_);
  document_.SetModifiedFlag();
  document_.RecordEdit(pageId_, !editName_.empty() || acting == nullptr ? editName_ : acting->name(),
                       form_.isSpinning());
  document_.UpdateAllViews(this);
  Refresh();
  return 1;
}

void CV27SetupFormView::Refresh() {
  const bool outer = std::exchange(keepFaults_, true);
  OnUpdate();
  keepFaults_ = outer;
}

std::string CV27SetupFormView::nameOf(const CV27SetupGridWnd& grid) {
  const auto found = std::ranges::find(form_.controls(), &grid, &Control::grid);
  return found == form_.controls().end() ? std::string() : found->name();
}

// Only the field that has just been changed is worth a message: the others had theirs.
bool CV27SetupFormView::UpdateData(bool save) {
  if (!save) {
    form_.show(document_.units(), keepFaults_);
    return true;
  }
  const std::string first = form_.store(document_.units());
  if (first.empty()) return true;
  const Control* acting = form_.acting();
  if (acting == nullptr) {
    document_.host().showFieldFault(first);
  } else if (!acting->fault.empty()) {
    document_.host().showFieldFault(acting->faultText());
  }
  return false;
}

FileField CV27SetupFormView::AddFile(Form& form, std::string_view label, FileChoice choice,
                                     std::string_view browse, std::string_view view) {
  Control& edit =
      form.Text(label, {.get = [choice]() -> std::optional<std::string> {
                          const FileRef held = choice.file({});
                          return held.name == nullptr ? std::nullopt : std::optional(held.name->text());
                        },
                        .set =
                            [this, choice](const std::string& typed) {
                              if (typed != choice.text({})) choice.type(typed, {}, document_);
                            }});
  edit.isFile = true;
  Control& browseButton = form.Button(browse, [this, choice, &edit] {
    SetEditName(edit.name());
    if (choice.choose({}, document_)) {
      edit.fault.clear();
      UpdateDoc();
    }
    SetEditName({});
  });
  Control& viewButton = form.Button(view, [this, choice] { choice.view({}, document_); });
  viewButton.EnabledIf([choice] { return choice.canView({}); });
  return {edit, browseButton.Beside(), viewButton.Beside()};
}

}  // namespace gridbay
