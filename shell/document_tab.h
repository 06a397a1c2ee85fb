#pragma once

#include <QDialogButtonBox>
#include <QHash>
#include <QLineEdit>
#include <QSplitter>
#include <QTimer>
#include <QTreeWidget>
#include <functional>
#include <memory>
#include <optional>

#include "plugin/setup_editor.h"
#include "shell/advice_strip.h"
#include "shell/cover_view.h"
#include "shell/file_notice.h"
#include "shell/page_pane.h"
#include "shell/summary_view.h"

namespace gridbay::shell {

// What a document asks of the window that it is shown in.
struct WindowServices {
  std::function<void(const EngineStart&)> startEngine;
  std::function<void(const std::string& path, int item)> openFile;
};

// "1 fault"
QString faultsText(unsigned faults);

// One open document: the tree with its search box beside what the chosen item shows, which is a page or a
// cover; before one is chosen, the first view with a summary of the setup below it.
class DocumentTab final : public QSplitter, public SetupHost, public MapHost {
  Q_OBJECT
 public:
  // Commands of the editor that have a key and a tool here.
  static constexpr int kValidate = 46019;
  static constexpr int kStart = 46018;

  DocumentTab(std::function<std::unique_ptr<SetupEditor>(SetupHost&)> make, WindowServices services,
              QWidget* parent);
  ~DocumentTab() override;

  // What a check found, and in which state of the model.
  struct Check {
    ValidationList messages;
    unsigned faults = 0;
    std::uint64_t state = 0;
  };

  SetupEditor& editor() { return *editor_; }
  PagePane& pane() { return *pane_; }
  CoverView& cover() { return *cover_; }
  // Where the page is, for what is to stand beside it.
  QSplitter& pages() { return *pages_; }
  // Marks items of the tree by their pages, with what the mark means; none for no marks.
  void markPages(const QHash<std::int32_t, QString>& tips);
  SummaryView& summary() { return *summary_; }
  QTreeWidget& tree() { return *tree_; }
  QLineEdit& filter() { return *filter_; }
  QFrame& notice() { return *notice_; }

  // The last check of this setup since it was opened, and whether it is of the model as it is now.
  const std::optional<Check>& check() const { return check_; }
  bool isCheckCurrent() const { return check_ && check_->state == editor_->modelState(); }

  // What is doubtful in the setup: of the model a moment after its last edit.
  const std::vector<Advice>& advice() const { return advice_; }
  AdviceStrip& adviceStrip() { return *adviceStrip_; }
  // Makes the fix of an advice, and goes to its page.
  void fixAdvice(std::size_t place);

  // Does a command of the editor, with what is typed and not yet entered, and shows the model anew.
  bool runCommand(int id);
  // The view that comes before a page is chosen.
  void showFirstView();
  // Selects the tree item of a page, and ends a search that hides it; false when the page does not apply.
  bool goToPage(std::int32_t id);
  void goToNeighbour(int direction);
  // A place on a page, which the keyboard follows unless it is at work elsewhere; false when the page does
  // not apply.
  enum class Keyboard { follows, stays };
  bool goToPlace(const PagePlace& place, Keyboard keyboard = Keyboard::follows);
  // The row (from 1, without headers) of the page that is at work; 0 for none.
  int currentRow() const { return pane_->currentCell().row; }
  // The item that is selected; 0 for none.
  std::int32_t currentPage() const;
  QString caption(std::int32_t id) const;
  // The setup's name, and with a mark while it has unsaved edits.
  QString name() const;
  QString title() const;

  // Reads or writes the setup, and watches its file from then on. What goes wrong has been said.
  bool open(const QString& path);
  bool recover(const QString& copy, const QString& path);
  bool save(const QString& path);
  // Whether another program has changed the file since it was read or written here.
  bool isChangedOnDisk() const { return notice_->isChanged(); }

  // Takes the last edit back, or does it again, and goes to its page.
  void undo();
  void redo();
  void setUnits(const UnitChoices& units);
  // Hands over what is typed and not yet entered.
  void commit() { pane_->commit(); }

  void show(const std::string& text) override;
  bool choose(CVdFileSelectorDlg& selector) override;
  // The field itself shows what is wrong with it.
  void showFieldFault(const std::string&) override {}
  bool askYesNo(const std::string& question) override;
  bool chooseFile(std::string_view filter, std::string_view extension, std::string* name) override;
  bool chooseSaveFile(std::string_view filter, std::string_view extension, std::string* name) override;
  bool editForm(std::string_view title, Form& form, const std::function<std::string()>& fault) override;
  bool editFormWithPicks(std::string_view title, Form& form, std::span<const FieldPick> picks,
                         const std::function<std::string()>& fault) override;
  bool chooseFileWithForm(const FileQuestion& question, Form& panel, std::string* name) override;
  void doLongWork(std::string_view title, const std::function<void(const Progress&)>& work) override;
  void openFile(const std::string& path, int item) override { services_.openFile(path, item); }
  void showMessages(const ValidationList& messages, unsigned faults) override;
  bool mayWriteOver(const std::string& path) override;
  void startEngine(const EngineStart& start) override { services_.startEngine(start); }
  bool isShiftHeld() override;

 signals:
  void documentChanged();
  // Another page, or another cell of it.
  void cellChosen();
  // Points of the current cell of a page, or of a dialog, are to be pointed at on the map.
  void pickWanted(gridbay::shell::PagePane* pane);
  // The setup was checked, or there is another one whose check is not known.
  void checked();
  void saved();
  // Another page, or none, is shown.
  void pageShown();
  // It goes, and its editor with it.
  void closing();
  // There is other advice.
  void advised();

 private:
  void offerPick(PagePane& pane, QDialogButtonBox& buttons);
  void lookForAdvice();
  void readForAdvice();
  void showAdvice();
  void fillTree();
  void applyVisibility();
  void showCurrentPage();
  void showSummary();
  void showEdit(const SetupEditor::Edit& edit);
  QTreeWidgetItem* itemOf(std::int32_t id) const { return itemsById_.value(id); }
  bool isShown(std::int32_t id) const;
  void leaveHiddenPage();
  bool replaceSetup(const std::function<bool()>& load);
  void watch();

  WindowServices services_;
  QLineEdit* filter_;
  QTreeWidget* tree_;
  QSplitter* pages_;
  PagePane* pane_;
  CoverView* cover_;
  SummaryView* summary_;
  FileNotice* notice_;
  QHash<std::int32_t, QTreeWidgetItem*> itemsById_;
  std::optional<Check> check_;
  AdviceStrip* adviceStrip_;
  QTimer adviceTimer_;   // runs from an edit to the look at what it has made
  QTimer readingTimer_;  // runs while data files are read for it
  std::vector<Advice> advice_;
  std::unique_ptr<SetupEditor> editor_;
};

}  // namespace gridbay::shell
