#include "pages/form_view.h"

#include "pages/grid_wnd.h"

namespace gridbay {

CV27SetupFormView::CV27SetupFormView(CVdDoc& document, std::int32_t templateId, PageId pageId)
    : document_(document), templateId_(templateId), pageId_(pageId) {}

CV27SetupFormView::~CV27SetupFormView() {
  document_.RemoveView(this);
}

void CV27SetupFormView::OnInitialUpdate() {
  DoDataExchange(form_);
  Initialize();
  document_.AddView(this, [this] { OnUpdate(); });
  SetData();
}

int CV27SetupFormView::UpdateDoc() {
  if (GetData() == 0) return 0;
  document_.Touch(pageId_);
  document_.SetModifiedFlag();
  const Control* acting = form_.acting();
  document_.RecordEdit(pageId_, !editName_.empty() || acting == nullptr ? editName_ : acting->name(),
                       form_.isSpinning());
  document_.UpdateAllViews(this);
  return 1;
}

bool CV27SetupFormView::UpdateData(bool save) {
  if (!save) {
    form_.show(document_.units());
    return true;
  }
  const std::string fault = form_.store(document_.units());
  if (!fault.empty()) document_.host().show(fault);
  return fault.empty();
}

void CV27SetupFormView::AddCount(Form& form, std::string_view label, std::int32_t& variable, int highestSpin,
                                 std::function<int()> count) {
  Control& control = form.DDX_Text(label, variable);
  const auto changed = [this] {
    UpdateDoc();
    SetData();
  };
  control.Changed(changed).Spin(
      0, highestSpin, [&control, changed, highestSpin, count = std::move(count)](int delta) {
        const int now = count();
        const int wanted = now + delta;
        if (!control.usable() || wanted == now || wanted < 0 || wanted > highestSpin) return;
        control.text = std::to_string(wanted);
        changed();
      });
}

void CV27SetupFormView::SetUpGrid(std::string_view label) {
  const Control& control = *form_.find(label);
  control.grid->SetParentPage(this);
  control.grid->Initialize();
  AddAlignRight(control);
  AddAlignBottom(control);
}

}  // namespace gridbay
