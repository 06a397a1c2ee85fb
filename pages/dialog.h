#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "pages/field_picks.h"
#include "pages/form.h"
#include "pages/grid_host.h"

namespace gridbay {

// A dialog with OK and Cancel: fields and grids over a copy, which its owner gives back on OK. What is done
// in it changes the copy at once, so that a count there has its rows, and nothing in the document.
class CV27SetupDialog : public GridHost {
 public:
  CV27SetupDialog(CVdDoc& document, std::string_view title) : document_(document), title_(title) {}
  CV27SetupDialog(const CV27SetupDialog&) = delete;
  CV27SetupDialog& operator=(const CV27SetupDialog&) = delete;

  // To be filled before the dialog is shown.
  Form& form() { return form_; }
  // What is wrong with the copy, beyond what a field shows of itself; empty for nothing. Asked on OK.
  void SetCheck(std::function<std::string()> check) { check_ = std::move(check); }
  // Fields that hold points together, whose picks change the copy.
  void AddPick(FieldPick pick);
  // Shows the dialog; 1 for OK, when the copy holds what was wanted.
  int DoModal();

  CVdDoc& document() override { return document_; }
  int UpdateDoc() override;
  void SetEditName(std::string) override {}
  void Refresh() override;
  std::string nameOf(const CV27SetupGridWnd&) override { return title_; }

 private:
  std::string fault();

  CVdDoc& document_;
  std::string title_;
  Form form_;
  std::vector<FieldPick> picks_;
  std::function<std::string()> check_;
};

}  // namespace gridbay
