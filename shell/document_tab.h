#pragma once

#include <QFileSystemWatcher>
#include <QHash>
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
  QFrame& notice() { return *notice_; }

  // Selects the tree item of a page; false when it is not to be seen.
  bool goToPage(std::int32_t id);
  void goToNeighbour(int direction);
  // The item that is selected; 0 for none.
  std::int32_t currentPage() const;
  QString caption(std::int32_t id) const;
  QString title() const;

  // Reads or writes the setup, and watches its file from then on. What goes wrong has been said.
  bool open(const QString& path);
  bool recover(const QString& copy, const QString& path);
  bool save(const QString& path);
  // Whether another program has changed the file since it was read or written here.
  bool isChangedOnDisk() const;

  // Takes the last edit back, or does it again, and goes to its page.
  void undo();
  void redo();
  void setUnits(const UnitChoices& units);
  // Hands over what is typed and not yet entered.
  void commit() { pane_->commit(); }

  void show(const std::string& text) override;
  bool choose(CVdFileSelectorDlg& selector) override;
  bool askYesNo(const std::string& question) override;
  bool chooseFile(std::string_view filter, std::string_view extension, std::string* name) override;
  bool chooseSaveFile(std::string_view filter, std::string_view extension, std::string* name) override;
  bool editForm(std::string_view title, Form& form, const std::function<std::string()>& fault) override;
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
  void showFirstView();
  void showEdit(const SetupEditor::Edit& edit);
  QTreeWidgetItem* itemOf(std::int32_t id) const { return itemsById_.value(id); }
  void leaveHiddenPage();
  void watch();
  void fileChanged();
  QFrame* makeNotice(QWidget* parent);

  WindowServices services_;
  QLineEdit* filter_;
  QTreeWidget* tree_;
  PagePane* pane_;
  QFrame* notice_;
  QLabel* noticeText_ = nullptr;
  QHash<std::int32_t, QTreeWidgetItem*> itemsById_;
  QFileSystemWatcher watcher_;
  // The file's time and size when it was read or written here.
  struct Stamp {
    qint64 time = 0;
    qint64 size = -1;
    bool operator==(const Stamp&) const = default;
  };
  static Stamp stampOf(const QString& path);
  Stamp stamp_;
  std::unique_ptr<SetupEditor> editor_;
};

}  // namespace gridbay::shell
