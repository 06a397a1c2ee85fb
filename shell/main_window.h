#pragma once

#include <QMainWindow>
#include <QPlainTextEdit>
#include <QProcess>
#include <QTabWidget>
#include <QTreeWidget>
#include <memory>
#include <vector>

#include "shell/document_tab.h"
#include "shell/editor_library.h"

namespace gridbay::shell {

// The window: documents as tabs, messages and run output in docks.
class MainWindow final : public QMainWindow {
  Q_OBJECT
 public:
  // The first library's editor is the one for a new document by default.
  explicit MainWindow(std::vector<std::unique_ptr<EditorLibrary>> libraries);
  ~MainWindow() override;

  DocumentTab* newDocument(std::size_t library);
  // Opens a setup in the editor for its extension; null when it can't be read, which is then said.
  DocumentTab* openDocument(const QString& path);
  bool saveDocument(const QString& path = {});
  DocumentTab* currentDocument() const;
  QTreeWidget& messages() { return *messages_; }
  QPlainTextEdit& output() { return *output_; }
  QProcess& engine() { return *engine_; }

 protected:
  void closeEvent(QCloseEvent* event) override;
  void dragEnterEvent(QDragEnterEvent* event) override;
  void dropEvent(QDropEvent* event) override;

 private:
  void buildMenus();
  void buildDocks();
  void rebuildRunMenu();
  // The list of setups opened last, newest first, and the menu that offers them.
  void remember(const QString& path);
  void rebuildRecentMenu();
  void showMessages(const ValidationList& messages, unsigned faults);
  void startEngine(const EngineStart& start);
  bool mayClose(DocumentTab& tab);
  bool closeTab(int index);

  std::vector<std::unique_ptr<EditorLibrary>> libraries_;
  QTabWidget* tabs_;
  QMenu* runMenu_ = nullptr;
  QMenu* recentMenu_ = nullptr;
  QTreeWidget* messages_ = nullptr;
  QPlainTextEdit* output_ = nullptr;
  QProcess* engine_ = nullptr;
};

}  // namespace gridbay::shell
