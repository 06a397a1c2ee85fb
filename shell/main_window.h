#pragma once

#include <QMainWindow>
#include <QPointer>
#include <QStackedWidget>
#include <QTabWidget>
#include <QTimer>
#include <QToolBar>
#include <QTreeWidget>
#include <map>
#include <memory>
#include <set>
#include <vector>

#include "shell/compare/compare_dock.h"
#include "shell/document_tab.h"
#include "shell/editor_library.h"
#include "shell/help_dock.h"
#include "shell/import/series_import.h"
#include "shell/import/terrain_import.h"
#include "shell/map/map_dock.h"
#include "shell/messages_dock.h"
#include "shell/recovery.h"
#include "shell/run_dock.h"
#include "shell/start_view.h"
#include "shell/units_menu.h"
#include "shell/viewers/data_window.h"

namespace gridbay::shell {

// The window: documents as tabs, or a start view while there are none; messages, run output and help in
// docks.
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
  void openFile(const QString& path, int item = 0);
  bool saveDocument(const QString& path = {});
  // Opens the dialog in which a map is made from terrain of any kind.
  void importTerrain();
  TerrainImport* terrainImport() { return terrainImport_; }
  // The same for a time series from a table of text.
  void importSeries();
  SeriesImport* seriesImport() { return seriesImport_; }
  // Puts another setup beside the one that is shown; false where it can't be read, which is then said.
  bool compareWith(const QString& path);
  // Merges two setups that have come from a third: the one that is shown, as it is now, and another, as one
  // step; or, where `own` names one, two files, into a new document. False where that is not done, with what
  // is wrong said.
  bool merge(const QString& base, const QString& own, const QString& other);
  // Offers the edits that a run which ended suddenly has left behind.
  void offerRecovery();

  DocumentTab* currentDocument() const;
  QTreeWidget& messages() { return messages_->list(); }
  MessagesDock& messagesDock() { return *messages_; }
  StartView& startView() { return *start_; }
  QToolBar& tools() { return *tools_; }
  RunDock& run() { return *run_; }
  HelpDock& help() { return *help_; }
  MapDock& map() { return *map_; }
  CompareDock& differences() { return *compare_; }
  UnitsMenu& units() { return *units_; }
  QAction* undoAction() { return undo_; }
  QAction* redoAction() { return redo_; }
  QAction* checkAction() { return commandAction(DocumentTab::kValidate); }

 protected:
  void closeEvent(QCloseEvent* event) override;
  void dragEnterEvent(QDragEnterEvent* event) override;
  void dropEvent(QDropEvent* event) override;

 private:
  static constexpr const char* kNumber = "number";  // of a document, by which its recovery copy is known

  void buildActions();
  void buildTools();
  void buildStartView();
  void buildMenus();
  QMenu* buildFileMenu();
  QMenu* buildEditMenu();
  QMenu* buildViewMenu();
  QMenu* buildWindowMenu();
  QMenu* buildHelpMenu();
  void buildDocks();
  void rebuildRunMenu();
  void rebuildWindowMenu();
  // The action for a command of the current document's editor; each is made once.
  QAction* commandAction(int id);
  void refreshActions();
  // The tabs, or the start view where there are none.
  void showTabsOrStart();
  // Opens, and has the user save under, a name of his choice.
  void askOpen();
  bool askSave();
  void askCompare();
  void askMerge();
  bool mergeInto(DocumentTab& tab, const QString& base, const QString& own, const QString& other);
  QString askSaveName(const DocumentTab& tab);
  // The list of setups opened last, newest first, and the menu that offers them.
  void remember(const QString& path);
  void rebuildRecentMenu();
  void forget(const QString& path);
  void openRecent(const QString& path);
  void showMessages(DocumentTab* tab);
  void startEngine(const EngineStart& start);
  void showHelp();
  // Shows the help of a window of its own.
  void showTopic(int topic, const QString& caption);
  UseStrip::Offer bathymetryUses();
  void useBathymetry(DocumentTab& tab, int area, const QString& map);
  UseStrip::Offer seriesUses(const QString& series);
  void useSeries(DocumentTab& tab, const SeriesPlace& place, const QString& series);
  void tell(const QString& text);
  void documentChanged(DocumentTab* tab);
  void writeRecoveryCopies();
  void offerRecovery(const Recovery::Left& left);
  bool recover(const Recovery::Left& left);
  std::size_t libraryOf(const QString& path) const;
  // The tab that a setup is open in, or null.
  DocumentTab* tabOf(const QString& path) const;
  void discardTab(DocumentTab* tab);
  bool mayClose(DocumentTab& tab);
  bool closeTab(int index);

  std::vector<std::unique_ptr<EditorLibrary>> libraries_;
  Recovery recovery_;
  std::set<DocumentTab*> unwritten_;  // with edits that have no recovery copy yet
  QTimer recoveryTimer_;
  int lastNumber_ = 0;
  QStackedWidget* central_;
  QTabWidget* tabs_;
  StartView* start_;
  QToolBar* tools_ = nullptr;
  std::vector<QAction*> fresh_;  // a new document of each library
  QAction* open_ = nullptr;
  QAction* save_ = nullptr;
  QAction* saveAs_ = nullptr;
  QAction* close_ = nullptr;
  QAction* undo_ = nullptr;
  QAction* redo_ = nullptr;
  QAction* helpOnPage_ = nullptr;
  QAction* summary_ = nullptr;
  std::map<int, QAction*> commands_;
  QMenu* freshMenu_ = nullptr;
  QMenu* runMenu_ = nullptr;
  QMenu* recentMenu_ = nullptr;
  QMenu* windowMenu_ = nullptr;
  UnitsMenu* units_ = nullptr;
  QPointer<TerrainImport> terrainImport_;
  QPointer<SeriesImport> seriesImport_;
  MessagesDock* messages_ = nullptr;
  RunDock* run_ = nullptr;
  HelpDock* help_ = nullptr;
  MapDock* map_ = nullptr;
  CompareDock* compare_ = nullptr;
  QAction* compareWith_ = nullptr;
  QAction* merge_ = nullptr;
};

}  // namespace gridbay::shell
