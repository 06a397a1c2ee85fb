#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "core/page_id.h"
#include "pages/form.h"
#include "pages/vd_doc.h"

namespace gridbay {

// Base of all form pages. A page holds variables for its controls and nothing else: every edit goes to the
// model at once, and what another view changes is loaded anew.
class CV27SetupFormView {
 public:
  CV27SetupFormView(CVdDoc& document, std::int32_t templateId, PageId pageId);
  CV27SetupFormView(const CV27SetupFormView&) = delete;
  CV27SetupFormView& operator=(const CV27SetupFormView&) = delete;
  virtual ~CV27SetupFormView();

  // Lists the controls, sets up the page and fills it. To be called once, before anything else.
  void OnInitialUpdate();
  // The model changed elsewhere.
  virtual void OnUpdate() { SetData(); }

  // Controls to model: 0 when a control's text is no value, with the model untouched.
  virtual int GetData() { return 1; }
  // Model to controls.
  virtual void SetData() { UpdateData(false); }

  // Pushes the page into the model, marks the document as modified and lets the other views know. Nonzero on
  // success.
  int UpdateDoc();
  // Names the edit that is being made, for as long as it is made; empty for that of a control.
  void SetEditName(std::string name) { editName_ = std::move(name); }

  // The root of the model, and the members that a room has in it.
  CKvsBase& GetKvs() { return document_.GetKvs(); }
  template <class Parts>
  Parts& parts() {
    return *GetKvs().parts<Parts>();
  }
  CVdDoc& document() { return document_; }
  bool HasBeenTouched(PageId page) const { return document_.HasBeenTouched(page); }

  Form& form() { return form_; }
  PageId pageId() const { return pageId_; }
  std::int32_t templateId() const { return templateId_; }
  // Controls that stretch with the page, to the right and downwards.
  const std::vector<const Control*>& alignedRight() const { return alignedRight_; }
  const std::vector<const Control*>& alignedBottom() const { return alignedBottom_; }

 protected:
  // The page's controls, in their order.
  virtual void DoDataExchange(Form& form) = 0;
  // Once, when the controls exist.
  virtual int Initialize() { return 1; }

  // With true controls to variables, and false when a text is no value; with false variables to controls.
  bool UpdateData(bool save);
  // The common shape of a count with a spin button: a change of either hands the page over and fills it anew.
  void AddCount(Form& form, std::string_view label, std::int32_t& variable, int highestSpin,
                std::function<int()> count);
  // Binds a grid to the page, runs its set-up and lets it stretch with the page.
  void SetUpGrid(std::string_view label);

  void AddAlignRight(const Control& control) { alignedRight_.push_back(&control); }
  void AddAlignBottom(const Control& control) { alignedBottom_.push_back(&control); }

 private:
  CVdDoc& document_;
  std::int32_t templateId_;
  PageId pageId_;
  Form form_;
  std::string editName_;
  std::vector<const Control*> alignedRight_;
  std::vector<const Control*> alignedBottom_;
};

}  // namespace gridbay
