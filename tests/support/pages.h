#pragma once

#include <gtest/gtest.h>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "pages/host.h"
#include "setup/page_factory.h"
#include "setup/setup_doc.h"

namespace gridbay::test {

// Answers what pages ask, and keeps what they showed.
class TestHost : public SetupHost {
 public:
  void show(const std::string& text) override { texts.push_back(text); }
  bool askYesNo(const std::string& question) override {
    questions.push_back(question);
    return answer;
  }
  bool choose(CVdFileSelectorDlg& selector) override {
    filters.push_back(selector.filter());
    if (!chosenFile) return false;
    selector.SetFileName(*chosenFile);
    selector.SetSelectedItems(chosenItems);
    return true;
  }
  bool chooseFile(std::string_view, std::string_view, std::string*) override { return false; }
  bool chooseSaveFile(std::string_view filter, std::string_view extension, std::string* name) override {
    filters.emplace_back(filter);
    extensions.emplace_back(extension);
    if (!chosenFile) return false;
    *name = *chosenFile;
    return true;
  }
  bool editForm(std::string_view title, Form& form, const std::function<std::string()>& fault) override {
    titles.emplace_back(title);
    if (!fillForm || !fillForm(form)) return false;
    formFault = fault();
    return formFault.empty();
  }
  bool chooseFileWithForm(const FileQuestion& question, Form& panel, std::string* name) override {
    titles.emplace_back(question.title);
    filters.emplace_back(question.filter);
    extensions.emplace_back(question.extension);
    std::string& last = lastFiles[std::string(question.purpose)];
    if (!chosenFile || (fillForm && !fillForm(panel))) return false;
    *name = last = *chosenFile;
    return true;
  }
  void doLongWork(std::string_view title, const std::function<void(const Progress&)>& work) override {
    titles.emplace_back(title);
    work([this](double done) {
      progress.push_back(done);
      return done < stopAt;
    });
  }
  void openFile(const std::string& path, int item) override {
    opened.push_back(path);
    openedItems.push_back(item);
  }
  void showMessages(const ValidationList& messages, unsigned faults) override {
    shown = messages;
    shownFaults = faults;
  }
  void startEngine(const EngineStart& start) override { starts.push_back(start); }
  bool isShiftHeld() override { return shift; }

  std::vector<std::string> texts;
  std::vector<std::string> questions;
  std::vector<std::string> filters;
  std::vector<std::string> extensions;  // asked for by save dialogs
  std::vector<std::string> titles;
  std::vector<std::string> opened;
  std::vector<int> openedItems;
  std::map<std::string, std::string> lastFiles;  // by what they were chosen for
  std::vector<double> progress;                  // of long work
  double stopAt = 2;                             // how far it gets; all is done at 1
  ValidationList shown;
  unsigned shownFaults = 0;
  std::vector<EngineStart> starts;
  bool shift = false;
  bool answer = true;
  std::optional<std::string> chosenFile;
  std::vector<std::uint32_t> chosenItems;
  std::function<bool(Form&)> fillForm;
  std::string formFault;
};

// A document with one page open, used by labels and cells as a user does.
class PageTest : public ::testing::Test {
 protected:
  void open(std::string_view pageClass) {
    page = makePage(pageClass, document);
    ASSERT_NE(page, nullptr) << pageClass;
  }
  CGlobalKvs& root() { return document.root(); }

  // The n-th control of a label.
  Control& control(std::string_view label, int n = 1) {
    for (Control& it : page->form().controls()) {
      if (it.label == label && --n == 0) return it;
    }
    ADD_FAILURE() << "there is no control \"" << label << '"';
    static Control none{.kind = ControlKind::label, .label = {}};
    return none;
  }
  void edit(std::string_view label, std::string_view text, int n = 1) {
    Control& it = control(label, n);
    EXPECT_TRUE(it.usable()) << label;
    it.text = text;
    page->form().act(it);
  }
  void choose(std::string_view label, int index) {
    Control& it = control(label);
    EXPECT_TRUE(it.usable()) << label;
    it.index = index;
    page->form().act(it);
  }
  void press(std::string_view label) {
    EXPECT_TRUE(control(label).usable()) << label;
    page->form().act(control(label));
  }
  void spin(std::string_view label, int delta) { page->form().spin(control(label), delta); }
  std::string text(std::string_view label, int n = 1) { return control(label, n).text; }
  std::vector<std::string> labels() {
    std::vector<std::string> all;
    for (const Control& it : page->form().controls()) all.push_back(it.label);
    return all;
  }

  CV27SetupGridWnd& grid() {
    for (const Control& it : page->form().controls()) {
      if (it.grid != nullptr) return *it.grid;
    }
    throw std::logic_error("the page has no grid");
  }
  CellStyle style(int row, int col) {
    CellStyle it;
    EXPECT_EQ(grid().GetStyleRowCol(row, col, it), 1) << row << ", " << col;
    return it;
  }
  std::string cell(int row, int col) { return style(row, col).value; }
  int store(int row, int col, std::string_view value) { return grid().StoreStyleRowCol(row, col, value); }
  std::vector<std::string> headers() {
    std::vector<std::string> all;
    for (int col = 0; col <= grid().GetColCount(); ++col) all.push_back(grid().GetColHeader(col));
    return all;
  }
  std::vector<int> widths() {
    std::vector<int> all;
    for (int col = 0; col <= grid().GetColCount(); ++col) all.push_back(grid().GetColWidth(col));
    return all;
  }
  using Labels = std::vector<std::string>;

  TestHost host;
  CV27SetupDoc document{host};
  std::unique_ptr<CV27SetupFormView> page;
};

}  // namespace gridbay::test
