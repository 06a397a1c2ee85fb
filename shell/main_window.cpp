#include "shell/main_window.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDesktopServices>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QMimeData>
#include <QSettings>
#include <QStandardPaths>
#include <QStatusBar>
#include <QUrl>

namespace gridbay::shell {
namespace {

constexpr int kMessagesTopic = 1;  // of the help
constexpr int kMapTopic = 2;

constexpr const char* kRecentKey = "recent";
constexpr const char* kGeometryKey = "window/geometry";
constexpr const char* kStateKey = "window/state";
constexpr int kMostRecent = 8;
constexpr int kRecoveryDelay = 1000;  // milliseconds after an edit

}  // namespace

MainWindow::MainWindow(std::vector<std::unique_ptr<EditorLibrary>> libraries)
    : libraries_(std::move(libraries)),
      recovery_(QStandardPaths::writableLocation(QStandardPaths::AppDataLocation) + "/recovery"),
      central_(new QStackedWidget(this)),
      tabs_(new QTabWidget(central_)),
      start_(new StartView(central_)) {
  setWindowTitle(QApplication::applicationDisplayName());
  resize(1100, 760);
  tabs_->setTabsClosable(true);
  tabs_->setDocumentMode(true);
  central_->addWidget(start_);
  central_->addWidget(tabs_);
  setCentralWidget(central_);
  setAcceptDrops(true);
  buildActions();
  buildDocks();
  buildMenus();
  buildTools();
  buildStartView();
  start_->setFocus();
  restoreGeometry(QSettings().value(kGeometryKey).toByteArray());
  restoreState(QSettings().value(kStateKey).toByteArray());
  connect(tabs_, &QTabWidget::tabCloseRequested, this, [this](int index) { closeTab(index); });
  connect(tabs_, &QTabWidget::currentChanged, this, [this] {
    rebuildRunMenu();
    rebuildWindowMenu();
    refreshActions();
    messages_->showCheckOf(currentDocument());
    map_->showDocument(currentDocument());
    compare_->showDocument(currentDocument());
    showTabsOrStart();
  });
  recoveryTimer_.setSingleShot(true);
  recoveryTimer_.setInterval(kRecoveryDelay);
  connect(&recoveryTimer_, &QTimer::timeout, this, [this] { writeRecoveryCopies(); });
}

// Documents go before the libraries that their code is in.
MainWindow::~MainWindow() {
  disconnect(tabs_, nullptr, this, nullptr);
  map_->showDocument(nullptr);
  compare_->showDocument(nullptr);
  while (tabs_->count() > 0) {
    QWidget* tab = tabs_->widget(0);
    tabs_->removeTab(0);
    delete tab;
  }
}

void MainWindow::buildDocks() {
  messages_ = new MessagesDock(commandAction(DocumentTab::kValidate), this);
  addDockWidget(Qt::BottomDockWidgetArea, messages_);
  connect(messages_, &MessagesDock::placeChosen, this, [this](const PagePlace& place) {
    DocumentTab* tab = currentDocument();
    if (tab != nullptr && !tab->goToPlace(place))
      statusBar()->showMessage(
          tr("The page %1 is not shown now.").arg(tab->caption(static_cast<std::int32_t>(place.page))));
  });
  connect(messages_, &MessagesDock::fixWanted, this, [this](int place) {
    if (DocumentTab* tab = currentDocument()) tab->fixAdvice(static_cast<std::size_t>(place));
  });

  run_ = new RunDock(this);
  addDockWidget(Qt::BottomDockWidgetArea, run_);
  tabifyDockWidget(messages_, run_);
  messages_->raise();
  resizeDocks({messages_}, {140}, Qt::Vertical);

  compare_ = new CompareDock(this);
  addDockWidget(Qt::BottomDockWidgetArea, compare_);
  tabifyDockWidget(messages_, compare_);
  compare_->hide();
  messages_->raise();
  connect(compare_, &CompareDock::failed, this,
          [this](const QString& text) { statusBar()->showMessage(text); });

  help_ = new HelpDock(this);
  addDockWidget(Qt::RightDockWidgetArea, help_);
  help_->hide();

  map_ = new MapDock(this);
  addDockWidget(Qt::RightDockWidgetArea, map_);
  map_->hide();
  connect(map_, &MapDock::failed, this, [this](const QString& text) { statusBar()->showMessage(text); });
}

DocumentTab* MainWindow::currentDocument() const {
  return static_cast<DocumentTab*>(tabs_->currentWidget());
}

void MainWindow::tell(const QString& text) {
  QMessageBox::warning(this, QApplication::applicationDisplayName(), text);
}

DocumentTab* MainWindow::newDocument(std::size_t library) {
  WindowServices services{
      [this](const EngineStart& start) { startEngine(start); },
      [this](const std::string& path, int item) { openFile(QString::fromStdString(path), item); }};
  auto* tab =
      new DocumentTab([this, library](SetupHost& host) { return libraries_[library]->newDocument(host); },
                      std::move(services), this);
  tab->setProperty(kNumber, ++lastNumber_);
  tab->setUnits(units_->units());
  const int index = tabs_->addTab(tab, tab->title());
  connect(tab, &DocumentTab::documentChanged, this, [this, tab] { documentChanged(tab); });
  connect(tab, &DocumentTab::checked, this, [this, tab] { showMessages(tab); });
  connect(tab, &DocumentTab::advised, this, [this, tab] {
    if (tab == currentDocument()) messages_->showAdvice();
  });
  connect(tab, &DocumentTab::saved, this,
          [this, tab] { remember(QString::fromStdString(tab->editor().path())); });
  tabs_->setCurrentIndex(index);
  rebuildRunMenu();
  rebuildWindowMenu();
  return tab;
}

void MainWindow::discardTab(DocumentTab* tab) {
  unwritten_.erase(tab);
  recovery_.forget(tab->property(kNumber).toInt());
  tabs_->removeTab(tabs_->indexOf(tab));
  delete tab;
  rebuildWindowMenu();
}

void MainWindow::showTabsOrStart() {
  QWidget* wanted = tabs_->count() > 0 ? static_cast<QWidget*>(tabs_) : start_;
  if (central_->currentWidget() == wanted) return;
  central_->setCurrentWidget(wanted);
  if (wanted == start_) start_->setFocus();
}

DocumentTab* MainWindow::tabOf(const QString& path) const {
  const QFileInfo wanted(path);
  for (int i = 0; i < tabs_->count(); ++i) {
    auto* tab = static_cast<DocumentTab*>(tabs_->widget(i));
    const QString own = QString::fromStdString(tab->editor().path());
    if (own.isEmpty() || path.isEmpty()) continue;
    const QFileInfo info(own);
    // A file that is gone has no canonical path.
    if (info.absoluteFilePath() == wanted.absoluteFilePath() || (wanted.exists() && info == wanted))
      return tab;
  }
  return nullptr;
}

std::size_t MainWindow::libraryOf(const QString& path) const {
  for (std::size_t i = 0; i < libraries_.size(); ++i) {
    if (path.endsWith(libraries_[i]->docString(CVdDocTemplate::kExtension), Qt::CaseInsensitive)) return i;
  }
  return 0;
}

DocumentTab* MainWindow::openDocument(const QString& path) {
  if (DocumentTab* open = tabOf(path)) {
    tabs_->setCurrentWidget(open);
    return open;
  }
  DocumentTab* tab = newDocument(libraryOf(path));
  if (tab->open(path)) {
    remember(path);
    return tab;
  }
  // Never an empty document that a save could write over the file.
  discardTab(tab);
  return nullptr;
}

DataWindow* MainWindow::openData(const QString& path) {
  QString error;
  DataWindow* window = DataWindow::open(path, this, &error);
  if (window == nullptr) {
    tell(error);
  } else {
    window->show();
  }
  return window;
}

void MainWindow::openFile(const QString& path, int item) {
  if (DataWindow::isDataFile(path)) {
    DataWindow* window = openData(path);
    if (window != nullptr && item > 0) window->showItem(item);
  } else if (!QFileInfo::exists(path)) {
    tell(tr("There is no file %1.").arg(path));
  } else if (!QDesktopServices::openUrl(QUrl::fromLocalFile(path))) {
    tell(tr("No program is known that opens %1.").arg(path));
  }
}

QString MainWindow::askSaveName(const DocumentTab& tab) {
  const QString extension = "." + QString::fromStdString(const_cast<DocumentTab&>(tab).editor().fileKind());
  QString label;
  for (const auto& library : libraries_) {
    if (library->docString(CVdDocTemplate::kExtension) == extension)
      label = library->docString(CVdDocTemplate::kFilterLabel);
  }
  QFileDialog dialog(this, {}, {}, label);
  dialog.setAcceptMode(QFileDialog::AcceptSave);
  dialog.setDefaultSuffix(extension.mid(1));
  return dialog.exec() == QDialog::Accepted ? dialog.selectedFiles().value(0) : QString();
}

bool MainWindow::saveDocument(const QString& path) {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return false;
  QString target = path.isEmpty() ? QString::fromStdString(tab->editor().path()) : path;
  if (target.isEmpty()) target = askSaveName(*tab);
  if (target.isEmpty()) return false;
  if (DocumentTab* other = tabOf(target); other != nullptr && other != tab) {
    tell(tr("%1 is open in another tab. Close it there, or choose another name.").arg(target));
    return false;
  }
  if (!tab->save(target)) return false;
  statusBar()->showMessage(tr("Saved %1").arg(target), 3000);
  return true;
}

bool MainWindow::askSave() {
  DocumentTab* tab = currentDocument();
  const QString path = tab == nullptr ? QString() : askSaveName(*tab);
  return !path.isEmpty() && saveDocument(path);
}

void MainWindow::documentChanged(DocumentTab* tab) {
  tabs_->setTabText(tabs_->indexOf(tab), tab->title());
  tabs_->setTabToolTip(tabs_->indexOf(tab), QString::fromStdString(tab->editor().path()));
  refreshActions();
  if (tab == currentDocument()) messages_->mark();
  if (tab->editor().isModified()) {
    unwritten_.insert(tab);
    if (!recoveryTimer_.isActive()) recoveryTimer_.start();
  } else {
    unwritten_.erase(tab);
    recovery_.forget(tab->property(kNumber).toInt());
  }
}

void MainWindow::showMessages(DocumentTab* tab) {
  if (tab != currentDocument()) return;
  messages_->showCheckOf(tab);
  if (!tab->check()) return;
  messages_->show();
  messages_->raise();
  statusBar()->showMessage(tr("%1: %2").arg(tab->title(), faultsText(tab->check()->faults)));
}

void MainWindow::startEngine(const EngineStart& start) {
  QString error;
  if (!run_->start(start, &error)) {
    tell(error);
    return;
  }
  run_->show();
  run_->raise();
}

void MainWindow::showHelp() {
  DocumentTab* tab = currentDocument();
  QString error;
  const QWidget* focused = QApplication::focusWidget();
  const int page = tab == nullptr ? 0 : tab->currentPage();
  bool isShown = true;
  if (messages_->isAncestorOf(focused)) {
    isShown = help_->showTopic(kMessagesTopic, messages_->windowTitle(), &error);
  } else if (map_->isAncestorOf(focused)) {
    isShown = help_->showTopic(kMapTopic, map_->windowTitle(), &error);
  } else if (page == 0) {
    isShown = help_->showTopic(0, tr("Overview"), &error);
  } else {
    isShown = help_->showTopic(tab->editor().helpTopic(page), tab->caption(page), &error);
  }
  if (!isShown) tell(error);
}

bool MainWindow::mayClose(DocumentTab& tab) {
  tab.commit();
  if (!tab.editor().isModified()) return true;
  tabs_->setCurrentWidget(&tab);
  const auto answer = QMessageBox::question(this, QApplication::applicationDisplayName(),
                                            tr("Save the changes to %1?").arg(tab.title()),
                                            QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel);
  return answer == QMessageBox::Discard || (answer == QMessageBox::Save && saveDocument());
}

bool MainWindow::closeTab(int index) {
  auto* tab = static_cast<DocumentTab*>(tabs_->widget(index));
  if (tab == nullptr || !mayClose(*tab)) return false;
  discardTab(tab);
  return true;
}

void MainWindow::remember(const QString& path) {
  const QString absolute = QFileInfo(path).absoluteFilePath();
  QStringList recent = QSettings().value(kRecentKey).toStringList();
  recent.removeAll(absolute);
  recent.prepend(absolute);
  QSettings().setValue(kRecentKey, recent.mid(0, kMostRecent));
  rebuildRecentMenu();
}

void MainWindow::forget(const QString& path) {
  QStringList recent = QSettings().value(kRecentKey).toStringList();
  recent.removeAll(path);
  QSettings().setValue(kRecentKey, recent);
  rebuildRecentMenu();
}

// A setup that is no longer there goes from the list, once that has been said.
void MainWindow::openRecent(const QString& path) {
  if (openDocument(path) == nullptr && !QFileInfo::exists(path)) forget(path);
}

void MainWindow::rebuildRecentMenu() {
  recentMenu_->clear();
  const QStringList recent = QSettings().value(kRecentKey).toStringList();
  for (const QString& path : recent) recentMenu_->addAction(path, this, [this, path] { openRecent(path); });
  recentMenu_->setEnabled(!recent.isEmpty());
  start_->showRecent(recent);
}

void MainWindow::dragEnterEvent(QDragEnterEvent* event) {
  if (event->mimeData()->hasUrls()) event->acceptProposedAction();
}

void MainWindow::dropEvent(QDropEvent* event) {
  for (const QUrl& url : event->mimeData()->urls()) {
    if (!url.isLocalFile()) continue;
    const QString path = url.toLocalFile();
    if (DataWindow::isDataFile(path)) {
      openData(path);
    } else {
      openDocument(path);
    }
  }
}

void MainWindow::closeEvent(QCloseEvent* event) {
  for (int i = 0; i < tabs_->count(); ++i) {
    if (mayClose(*static_cast<DocumentTab*>(tabs_->widget(i)))) continue;
    event->ignore();
    return;
  }
  QSettings settings;
  settings.setValue(kGeometryKey, saveGeometry());
  settings.setValue(kStateKey, saveState());
  event->accept();
}

}  // namespace gridbay::shell
