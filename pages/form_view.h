#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>

#include "core/page_id.h"
#include "pages/file_choice.h"
#include "pages/form.h"
#include "pages/grid_host.h"
#include "pages/vd_doc.h"

namespace gridbay {

// The controls of a file: the edit, the button that lets the user choose, and the one that shows the file.
struct FileField {
  Control& edit;
  Control& browse;
  Control& view;

  FileField& EnabledIf(const Control::Rule& rule);
  FileField& VisibleIf(const Control::Rule& rule);
};

// Base of all form pages. A page lists its controls and holds nothing that matters: every edit goes to the
// model at once, and the model is shown anew after each change of it, whoever made it.
class CV27SetupFormView : public GridHost {
 public:
  CV27SetupFormView(CVdDoc& document, std::int32_t templateId, PageId pageId);
  CV27SetupFormView(const CV27SetupFormView&) = delete;
  CV27SetupFormView& operator=(const CV27SetupFormView&) = delete;
  ~CV27SetupFormView() override;

  // Lists the controls, sets up the page with its grids and fills it. To be called once, before anything
  // else.
  void OnInitialUpdate();
  // The model has changed.
  virtual void OnUpdate() { SetData(); }
  // The page is about to be left. Who shows the page calls this before it destroys it.
  virtual void OnLeave() {}

  // Controls to model, by their bindings: 0 when a control's text is no value, with the model untouched.
  virtual int GetData();
  // Model to controls, by their bindings, and the enable rule.
  virtual void SetData();

  // Pushes the page into the model, marks the document as modified, and has all views show it, this page
  // included. Nonzero on success. While a text is no value nothing is pushed but what the user has just
  // changed; the text stays in its field.
  int UpdateDoc() override;
  void SetEditName(std::string name) override { editName_ = std::move(name); }
  void Refresh() override;
  std::string nameOf(const CV27SetupGridWnd& grid) override;

  CVdDoc& document() override { return document_; }
  bool HasBeenTouched(PageId page) const { return document_.HasBeenTouched(page); }

  Form& form() { return form_; }
  PageId pageId() const { return pageId_; }
  std::int32_t templateId() const { return templateId_; }

 protected:
  // The page's controls, in their order.
  virtual void DoDataExchange(Form& form) = 0;
  // Once, when the controls exist.
  virtual int Initialize() { return 1; }
  // The rules of the controls. A page that has more of them calls this first.
  virtual void EnableControls() { form_.applyRules(); }

  // With true controls to variables, and false when a text is no value; with false variables to controls.
  bool UpdateData(bool save);
  // The name of a file with its two buttons beside it.
  FileField AddFile(Form& form, std::string_view label, FileChoice choice, std::string_view browse = "...",
                    std::string_view view = "View...");

  // What is registered stretches with the page, to the right or downwards, and nothing else does.
  static void AddAlignRight(Control& control) { control.alignRight = true; }
  static void AddAlignBottom(Control& control) { control.alignBottom = true; }

 private:
  CVdDoc& document_;
  std::int32_t templateId_;
  PageId pageId_;
  Form form_;
  std::string editName_;
  bool keepFaults_ = false;
};

// A page by the numbers of its dialog template and of itself.
template <std::int32_t dialogTemplate, PageId id>
class Page : public CV27SetupFormView {
 public:
  explicit Page(CVdDoc& document) : CV27SetupFormView(document, dialogTemplate, id) {}
};

}  // namespace gridbay
