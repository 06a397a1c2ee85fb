#pragma once

#include <QLineEdit>
#include <QSplitter>
#include <QTreeWidget>
#include <functional>
#include <memory>

#include "plugin/setup_editor.h"
#include "shell/page_pane.h"

namespace gridbay::shell {

// What a document asks of the window that it is shown in.
struct WindowServices {
  std::function<void(const ValidationList&, unsigned)> showMessages;
  std::function<void(const EngineStart&)> startEngine;
  std::function<void(const std::string&)> openFile;
};

// One open document: the tree with its filter box beside the page pane.
class DocumentTab final : public QSplitter, public SetupHost {
  Q_OBJECT
 public:
  DocumentTab(std::function<std::unique_ptr<SetupEditor>(SetupHost&)> make, WindowServices services,
              QWidget* parent);
  ~DocumentTab() override;

  SetupEditor& editor() { return *editor_; }
  PagePane& pane() { return *pane_; }
  QTreeWidget& tree() { return *tree_; }
  // Selects the tree item of a page; false when it is not to be seen.
  bool goToPage(std::int32_t id);
  void goToNeighbour(int direction);
  QString title() const;

  void show(const std::string& text) override;
  bool choose(CVdFileSelectorDlg& selector) override;
  bool askYesNo(const std::string& question) override;
  bool chooseFile(std::string_view filter, std::string_view extension, std::string* name) override;
  bool editForm(std::string_view title, Form& form) override;
  void openFile(const std::string& path) override { services_.openFile(path); }
  void showMessages(const ValidationList& messages, unsigned faults) override {
    services_.showMessages(messages, faults);
  }
  void startEngine(const EngineStart& start) override { services_.startEngine(start); }
  bool isShiftHeld() override;

 signals:
  void documentChanged();

 private:
  void fillTree();
  void applyVisibility();
  void showCurrentPage();
  QTreeWidgetItem* itemOf(std::int32_t id) const;

  WindowServices services_;
  QLineEdit* filter_;
  QTreeWidget* tree_;
  PagePane* pane_;
  std::unique_ptr<SetupEditor> editor_;
};

}  // namespace gridbay::shell
