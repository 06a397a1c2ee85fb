#pragma once

#include <QMainWindow>
#include <QTabWidget>
#include <QTimer>
#include <QTreeWidget>
#include <memory>
#include <set>
#include <vector>

#include "shell/document_tab.h"
#include "shell/editor_library.h"
#include "shell/help_dock.h"
#include "shell/recovery.h"
#include "shell/run_dock.h"
#include "shell/units_menu.h"
#include "shell/viewers/data_window.h"

namespace gridbay::shell {

// The window: documents as tabs, messages, run output and help in docks.
class MainWindow final : public QMainWindow {
  Q_OBJECT
 public:
  // The first library's editor is the one for a new document by default.
  explicit MainWindow(std::vector<std::unique_ptr<EditorLibrary>> libraries);
  ~MainWindow() override;

  DocumentTab* newDocument(std::size_t library);
  // Opens a setup in the editor for its extension; null when it can't be read, which is then said.
  DocumentTab* openDocument(const QString& path);
  // Opens a data file in a window of its own; null when it can't be read, which is then said.
  DataWindow* openData(const QString& path);
  // A setup or a data file, by its extension; any other file by the program that the desktop has for it.
  void openFile(const QString& path);
  bool saveDocument(const QString& path = {});
  // Offers the edits that a run which ended suddenly has left behind.
  void offerRecovery();

  DocumentTab* currentDocument() const;
  QTreeWidget& messages() { return *messages_; }
  RunDock& run() { return *run_; }
  HelpDock& help() { return *help_; }
  UnitsMenu& units() { return *units_; }
  QAction* undoAction() { return undo_; }
  QAction* redoAction() { return redo_; }

 protected:
  void closeEvent(QCloseEvent* event) override;
  void dragEnterEvent(QDragEnterEvent* event) override;
  void dropEvent(QDropEvent* event) override;

 private:
  void buildMenus();
  QMenu* buildFileMenu();
  QMenu* buildEditMenu();
  QMenu* buildViewMenu();
  QMenu* buildWindowMenu();
  QMenu* buildHelpMenu();
  void buildDocks();
  void rebuildRunMenu();
  void rebuildWindowMenu();
  void refreshEditMenu();
  // Opens, and has the user save under, a name of his choice.
  void askOpen();
  bool askSave();
  QString askSaveName(const DocumentTab& tab);
  // The list of setups opened last, newest first, and the menu that offers them.
  void remember(const QString& path);
  void rebuildRecentMenu();
  void showMessages(DocumentTab* tab, const ValidationList& messages, unsigned faults);
  void startEngine(const EngineStart& start);
  void showHelp();
  void tell(const QString& text);
  void documentChanged(DocumentTab* tab);
  void writeRecoveryCopies();
  std::size_t libraryOf(const QString& path) const;
  bool mayClose(DocumentTab& tab);
  bool closeTab(int index);

  std::vector<std::unique_ptr<EditorLibrary>> libraries_;
  Recovery recovery_;
  std::set<DocumentTab*> unwritten_;  // with edits that have no recovery copy yet
  QTimer recoveryTimer_;
  int lastNumber_ = 0;
  QTabWidget* tabs_;
  QMenu* runMenu_ = nullptr;
  QMenu* recentMenu_ = nullptr;
  QMenu* windowMenu_ = nullptr;
  UnitsMenu* units_ = nullptr;
  QAction* undo_ = nullptr;
  QAction* redo_ = nullptr;
  QTreeWidget* messages_ = nullptr;
  RunDock* run_ = nullptr;
  HelpDock* help_ = nullptr;
};

}  // namespace gridbay::shell
