#include "shell/main_window.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QDesktopServices>
#include <QDockWidget>
#include <QFileDialog>
#include <QFileInfo>
#include <QMenuBar>
#include <QMessageBox>
#include <QMimeData>
#include <QSettings>
#include <QStandardPaths>
#include <QStatusBar>
#include <QStyle>
#include <QUrl>

namespace gridbay::shell {
namespace {

constexpr const char* kRecentKey = "recent";
constexpr const char* kGeometryKey = "window/geometry";
constexpr const char* kStateKey = "window/state";
constexpr int kMostRecent = 8;
constexpr int kPageRole = Qt::UserRole;
constexpr int kValidate = 46019;
constexpr int kStart = 46018;

}  // namespace

MainWindow::MainWindow(std::vector<std::unique_ptr<EditorLibrary>> libraries)
    : libraries_(std::move(libraries)), tabs_(new QTabWidget(this)) {
  setWindowTitle(QApplication::applicationDisplayName());
  resize(1100, 760);
  tabs_->setTabsClosable(true);
  tabs_->setDocumentMode(true);
  setCentralWidget(tabs_);
  setAcceptDrops(true);
  buildDocks();
  buildMenus();
  restoreGeometry(QSettings().value(kGeometryKey).toByteArray());
  restoreState(QSettings().value(kStateKey).toByteArray());
  connect(tabs_, &QTabWidget::tabCloseRequested, this, [this](int index) { closeTab(index); });
  connect(tabs_, &QTabWidget::currentChanged, this, [this] { rebuildRunMenu(); });
}

// Documents go before the libraries that their code is in.
MainWindow::~MainWindow() {
  while (tabs_->count() > 0) {
    QWidget* tab = tabs_->widget(0);
    tabs_->removeTab(0);
    delete tab;
  }
}

void MainWindow::buildMenus() {
  QMenu* file = menuBar()->addMenu(tr("&File"));
  QMenu* fresh = file->addMenu(tr("&New"));
  for (std::size_t i = 0; i < libraries_.size(); ++i) {
    QAction* action = fresh->addAction(libraries_[i]->docString(CVdDocTemplate::kNewFileName), this,
                                       [this, i] { newDocument(i); });
    if (i == 0) action->setShortcut(QKeySequence::New);
  }
  file->addAction(tr("&Open..."), QKeySequence::Open, this, [this] {
    QStringList filters;
    for (const auto& library : libraries_) filters << library->docString(CVdDocTemplate::kFilterLabel);
    const QString path = QFileDialog::getOpenFileName(this, {}, {}, filters.join(";;"));
    if (!path.isEmpty()) openDocument(path);
  });
  recentMenu_ = file->addMenu(tr("Open &Recent"));
  rebuildRecentMenu();
  file->addAction(tr("&Close"), QKeySequence::Close, this, [this] { closeTab(tabs_->currentIndex()); });
  file->addSeparator();
  file->addAction(tr("&Save"), QKeySequence::Save, this, [this] { saveDocument(); });
  file->addAction(tr("Save &As..."), QKeySequence::SaveAs, this, [this] {
    const QString path = QFileDialog::getSaveFileName(this);
    if (!path.isEmpty()) saveDocument(path);
  });
  file->addSeparator();
  file->addAction(tr("E&xit"), QKeySequence::Quit, this, &QWidget::close);

  QMenu* view = menuBar()->addMenu(tr("&View"));
  QMenu* units = view->addMenu(tr("&Units"));
  units->addAction(tr("&Metric"), this, [this] {
    if (DocumentTab* tab = currentDocument())
      tab->editor().setUnitSystem(UnitSystem::metric), tab->pane().refresh();
  });
  units->addAction(tr("&US"), this, [this] {
    if (DocumentTab* tab = currentDocument())
      tab->editor().setUnitSystem(UnitSystem::us), tab->pane().refresh();
  });
  view->addAction(tr("&Previous page"), QKeySequence(Qt::CTRL | Qt::Key_PageUp), this, [this] {
    if (DocumentTab* tab = currentDocument()) tab->goToNeighbour(-1);
  });
  view->addAction(tr("&Next page"), QKeySequence(Qt::CTRL | Qt::Key_PageDown), this, [this] {
    if (DocumentTab* tab = currentDocument()) tab->goToNeighbour(1);
  });
  runMenu_ = menuBar()->addMenu(tr("&Run"));
  rebuildRunMenu();
  QMenu* help = menuBar()->addMenu(tr("&Help"));
  help->addAction(tr("&About"), this, [this] {
    QMessageBox::about(this, QApplication::applicationDisplayName(),
                       tr("The setup editor of a nested-grid flow model."));
  });
}

void MainWindow::buildDocks() {
  messages_ = new QTreeWidget(this);
  messages_->setHeaderLabels({tr("Message"), tr("Page")});
  messages_->setRootIsDecorated(false);
  messages_->setColumnWidth(0, 700);
  auto* dock = new QDockWidget(tr("Messages"), this);
  dock->setObjectName("messages");
  dock->setWidget(messages_);
  addDockWidget(Qt::BottomDockWidgetArea, dock);
  connect(messages_, &QTreeWidget::itemActivated, this, [this](const QTreeWidgetItem* item) {
    if (DocumentTab* tab = currentDocument()) tab->goToPage(item->data(0, kPageRole).toInt());
  });

  output_ = new QPlainTextEdit(this);
  output_->setReadOnly(true);
  auto* run = new QDockWidget(tr("Run"), this);
  run->setObjectName("run");
  run->setWidget(output_);
  addDockWidget(Qt::BottomDockWidgetArea, run);
  tabifyDockWidget(dock, run);
  dock->raise();
  resizeDocks({dock}, {140}, Qt::Vertical);

  engine_ = new QProcess(this);
  engine_->setProcessChannelMode(QProcess::MergedChannels);
  connect(engine_, &QProcess::readyReadStandardOutput, this, [this] {
    output_->appendPlainText(QString::fromUtf8(engine_->readAllStandardOutput()).trimmed());
  });
  connect(engine_, &QProcess::finished, this, [this](int code, QProcess::ExitStatus) {
    output_->appendPlainText(tr("Ended with status %1").arg(code));
  });
}

void MainWindow::rebuildRunMenu() {
  runMenu_->clear();
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return;
  for (const SetupEditor::Command& command : tab->editor().commands()) {
    QAction* action =
        runMenu_->addAction(QString::fromStdString(command.text), this, [this, id = command.id] {
          if (DocumentTab* current = currentDocument()) current->editor().command(id);
          rebuildRunMenu();
        });
    action->setCheckable(command.checked);
    action->setChecked(command.checked);
    if (command.id == kValidate) action->setShortcut(Qt::Key_F7);
    if (command.id == kStart) action->setShortcut(Qt::Key_F5);
  }
  runMenu_->addAction(tr("S&top simulation"), this, [this] { engine_->terminate(); });
}

DocumentTab* MainWindow::currentDocument() const {
  return static_cast<DocumentTab*>(tabs_->currentWidget());
}

DocumentTab* MainWindow::newDocument(std::size_t library) {
  WindowServices services{
      [this](const ValidationList& messages, unsigned faults) { showMessages(messages, faults); },
      [this](const EngineStart& start) { startEngine(start); },
      [](const std::string& path) {
        QDesktopServices::openUrl(QUrl::fromLocalFile(QString::fromStdString(path)));
      }};
  auto* tab =
      new DocumentTab([this, library](SetupHost& host) { return libraries_[library]->newDocument(host); },
                      std::move(services), this);
  const int index = tabs_->addTab(tab, tab->title());
  connect(tab, &DocumentTab::documentChanged, this,
          [this, tab] { tabs_->setTabText(tabs_->indexOf(tab), tab->title()); });
  tabs_->setCurrentIndex(index);
  rebuildRunMenu();
  return tab;
}

DocumentTab* MainWindow::openDocument(const QString& path) {
  std::size_t library = 0;
  for (std::size_t i = 0; i < libraries_.size(); ++i) {
    if (path.endsWith(libraries_[i]->docString(CVdDocTemplate::kExtension), Qt::CaseInsensitive)) library = i;
  }
  DocumentTab* tab = newDocument(library);
  if (tab->editor().open(path.toStdString())) {
    tabs_->setTabText(tabs_->indexOf(tab), tab->title());
    remember(path);
    return tab;
  }
  // Never an empty document that a save could write over the file.
  tabs_->removeTab(tabs_->indexOf(tab));
  delete tab;
  return nullptr;
}

bool MainWindow::saveDocument(const QString& path) {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return false;
  QString target = path.isEmpty() ? QString::fromStdString(tab->editor().path()) : path;
  if (target.isEmpty()) target = QFileDialog::getSaveFileName(this);
  if (target.isEmpty() || !tab->editor().save(target.toStdString())) return false;
  tabs_->setTabText(tabs_->indexOf(tab), tab->title());
  remember(target);
  statusBar()->showMessage(tr("Saved %1").arg(target), 3000);
  return true;
}

void MainWindow::showMessages(const ValidationList& messages, unsigned faults) {
  messages_->clear();
  for (const CMessage& message : messages) {
    auto* item = new QTreeWidgetItem(messages_);
    item->setText(0, QString::fromStdString(message.text));
    item->setText(1, QString::number(static_cast<int>(message.page)));
    item->setData(0, kPageRole, static_cast<int>(message.page));
    item->setIcon(0,
                  style()->standardIcon(message.severity == Severity::fault ? QStyle::SP_MessageBoxWarning
                                                                            : QStyle::SP_MessageBoxCritical));
  }
  statusBar()->showMessage(faults == 1 ? tr("1 fault") : tr("%1 faults").arg(faults));
}

void MainWindow::startEngine(const EngineStart& start) {
  const QString name = QString::fromStdString(start.engine);
  const QStringList names{name, QFileInfo(name).completeBaseName()};
  QString program = qEnvironmentVariable("GRIDBAY_ENGINE");
  for (const QString& candidate : names) {
    if (program.isEmpty())
      program = QStandardPaths::findExecutable(candidate, {QApplication::applicationDirPath()});
    if (program.isEmpty()) program = QStandardPaths::findExecutable(candidate);
  }
  if (program.isEmpty()) {
    QMessageBox::warning(
        this, QApplication::applicationDisplayName(),
        tr("There is no engine %1: it was looked for in %2, and on the PATH. GRIDBAY_ENGINE can name one.")
            .arg(name, QApplication::applicationDirPath()));
    return;
  }
  output_->clear();
  engine_->start(program, {QString::fromStdString(start.input)});
}

bool MainWindow::mayClose(DocumentTab& tab) {
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
  tabs_->removeTab(index);
  delete tab;
  return true;
}

void MainWindow::remember(const QString& path) {
  QSettings settings;
  QStringList recent = settings.value(kRecentKey).toStringList();
  const QString absolute = QFileInfo(path).absoluteFilePath();
  recent.removeAll(absolute);
  recent.prepend(absolute);
  settings.setValue(kRecentKey, recent.mid(0, kMostRecent));
  rebuildRecentMenu();
}

void MainWindow::rebuildRecentMenu() {
  recentMenu_->clear();
  const QStringList recent = QSettings().value(kRecentKey).toStringList();
  for (const QString& path : recent) recentMenu_->addAction(path, this, [this, path] { openDocument(path); });
  recentMenu_->setEnabled(!recent.isEmpty());
}

void MainWindow::dragEnterEvent(QDragEnterEvent* event) {
  if (event->mimeData()->hasUrls()) event->acceptProposedAction();
}

void MainWindow::dropEvent(QDropEvent* event) {
  for (const QUrl& url : event->mimeData()->urls()) {
    if (url.isLocalFile()) openDocument(url.toLocalFile());
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
