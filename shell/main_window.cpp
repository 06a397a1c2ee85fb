#include "shell/main_window.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QDesktopServices>
#include <QDockWidget>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QMimeData>
#include <QPointer>
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
constexpr const char* kNumber = "number";  // of a document, by which its recovery copy is known
constexpr int kMostRecent = 8;
constexpr int kPageRole = Qt::UserRole;
constexpr int kTabRole = Qt::UserRole + 1;
constexpr int kRecoveryDelay = 1000;  // milliseconds after an edit

}  // namespace

MainWindow::MainWindow(std::vector<std::unique_ptr<EditorLibrary>> libraries)
    : libraries_(std::move(libraries)),
      recovery_(QStandardPaths::writableLocation(QStandardPaths::AppDataLocation) + "/recovery"),
      tabs_(new QTabWidget(this)) {
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
  connect(tabs_, &QTabWidget::currentChanged, this, [this] {
    rebuildRunMenu();
    rebuildWindowMenu();
    refreshEditMenu();
  });
  recoveryTimer_.setSingleShot(true);
  recoveryTimer_.setInterval(kRecoveryDelay);
  connect(&recoveryTimer_, &QTimer::timeout, this, [this] { writeRecoveryCopies(); });
}

// Documents go before the libraries that their code is in.
MainWindow::~MainWindow() {
  disconnect(tabs_, nullptr, this, nullptr);
  while (tabs_->count() > 0) {
    QWidget* tab = tabs_->widget(0);
    tabs_->removeTab(0);
    delete tab;
  }
}

void MainWindow::buildDocks() {
  messages_ = new QTreeWidget(this);
  messages_->setHeaderLabels({tr("Message"), tr("Page")});
  messages_->setRootIsDecorated(false);
  messages_->setColumnWidth(0, 700);
  messages_->setAccessibleName(tr("Messages"));
  auto* dock = new QDockWidget(tr("Messages"), this);
  dock->setObjectName("messages");
  dock->setWidget(messages_);
  addDockWidget(Qt::BottomDockWidgetArea, dock);
  connect(messages_, &QTreeWidget::itemActivated, this, [this](const QTreeWidgetItem* item) {
    auto* tab = qobject_cast<DocumentTab*>(item->data(0, kTabRole).value<QObject*>());
    if (tab == nullptr || tabs_->indexOf(tab) < 0) return;
    tabs_->setCurrentWidget(tab);
    const int page = item->data(0, kPageRole).toInt();
    if (!tab->goToPage(page))
      statusBar()->showMessage(tr("The page %1 is not shown now.").arg(tab->caption(page)));
  });

  run_ = new RunDock(this);
  addDockWidget(Qt::BottomDockWidgetArea, run_);
  tabifyDockWidget(dock, run_);
  dock->raise();
  resizeDocks({dock}, {140}, Qt::Vertical);

  help_ = new HelpDock(this);
  addDockWidget(Qt::RightDockWidgetArea, help_);
  help_->hide();
}

DocumentTab* MainWindow::currentDocument() const {
  return static_cast<DocumentTab*>(tabs_->currentWidget());
}

void MainWindow::tell(const QString& text) {
  QMessageBox::warning(this, QApplication::applicationDisplayName(), text);
}

DocumentTab* MainWindow::newDocument(std::size_t library) {
  // The services need the tab that they are for.
  auto self = std::make_shared<QPointer<DocumentTab>>();
  WindowServices services{[this, self](const ValidationList& messages, unsigned faults) {
                            showMessages(*self, messages, faults);
                          },
                          [this](const EngineStart& start) { startEngine(start); },
                          [this](const std::string& path) { openFile(QString::fromStdString(path)); }};
  auto* tab =
      new DocumentTab([this, library](SetupHost& host) { return libraries_[library]->newDocument(host); },
                      std::move(services), this);
  *self = tab;
  tab->setProperty(kNumber, ++lastNumber_);
  tab->setUnits(units_->units());
  const int index = tabs_->addTab(tab, tab->title());
  connect(tab, &DocumentTab::documentChanged, this, [this, tab] { documentChanged(tab); });
  tabs_->setCurrentIndex(index);
  rebuildRunMenu();
  rebuildWindowMenu();
  return tab;
}

std::size_t MainWindow::libraryOf(const QString& path) const {
  for (std::size_t i = 0; i < libraries_.size(); ++i) {
    if (path.endsWith(libraries_[i]->docString(CVdDocTemplate::kExtension), Qt::CaseInsensitive)) return i;
  }
  return 0;
}

DocumentTab* MainWindow::openDocument(const QString& path) {
  for (int i = 0; i < tabs_->count(); ++i) {
    auto* open = static_cast<DocumentTab*>(tabs_->widget(i));
    const QString own = QString::fromStdString(open->editor().path());
    if (own.isEmpty() || QFileInfo(own) != QFileInfo(path) || !QFileInfo::exists(path)) continue;
    tabs_->setCurrentIndex(i);
    return open;
  }
  DocumentTab* tab = newDocument(libraryOf(path));
  if (tab->open(path)) {
    remember(path);
    return tab;
  }
  // Never an empty document that a save could write over the file.
  tabs_->removeTab(tabs_->indexOf(tab));
  delete tab;
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

void MainWindow::openFile(const QString& path) {
  if (DataWindow::isDataFile(path)) {
    openData(path);
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
  if (target.isEmpty() || !tab->save(target)) return false;
  remember(target);
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
  refreshEditMenu();
  if (tab->editor().isModified()) {
    unwritten_.insert(tab);
    if (!recoveryTimer_.isActive()) recoveryTimer_.start();
  } else {
    unwritten_.erase(tab);
    recovery_.forget(tab->property(kNumber).toInt());
  }
}

void MainWindow::writeRecoveryCopies() {
  for (DocumentTab* tab : unwritten_) {
    const int number = tab->property(kNumber).toInt();
    SetupEditor& editor = tab->editor();
    const bool noted = recovery_.note(number, QString::fromStdString(editor.path()),
                                      "." + QString::fromStdString(editor.fileKind()));
    const std::string fault = editor.writeRecoveryCopy(recovery_.copyOf(number).toStdString());
    if (!noted || !fault.empty())
      statusBar()->showMessage(
          tr("Unsaved edits cannot be kept for a crash: %1")
              .arg(fault.empty() ? recovery_.copyOf(number) : QString::fromStdString(fault)));
  }
  unwritten_.clear();
}

void MainWindow::offerRecovery() {
  for (const Recovery::Left& left : recovery_.left()) {
    const QString name = left.path.isEmpty() ? tr("a setup that was never saved") : left.path;
    QMessageBox box(QMessageBox::Question, QApplication::applicationDisplayName(),
                    tr("There are unsaved edits of %1, from %2. The program ended before they were saved.")
                        .arg(name, left.time.toString("yyyy-MM-dd hh:mm:ss")),
                    QMessageBox::Open | QMessageBox::Discard | QMessageBox::Ignore, this);
    box.button(QMessageBox::Open)->setText(tr("&Recover"));
    box.button(QMessageBox::Ignore)->setText(tr("&Later"));
    const int answer = box.exec();
    if (answer == QMessageBox::Open) {
      DocumentTab* tab = newDocument(libraryOf(left.extension));
      if (!tab->recover(left.copy, left.path)) {
        tabs_->removeTab(tabs_->indexOf(tab));
        delete tab;
        continue;
      }
      writeRecoveryCopies();
    }
    if (answer != QMessageBox::Ignore) Recovery::discard(left);
  }
}

void MainWindow::showMessages(DocumentTab* tab, const ValidationList& messages, unsigned faults) {
  messages_->clear();
  for (const CMessage& message : messages) {
    auto* item = new QTreeWidgetItem(messages_);
    const int page = static_cast<int>(message.page);
    item->setText(0, QString::fromStdString(message.text));
    item->setText(1, tab->caption(page));
    item->setData(0, kPageRole, page);
    item->setData(0, kTabRole, QVariant::fromValue<QObject*>(tab));
    item->setIcon(0,
                  style()->standardIcon(message.severity == Severity::fault ? QStyle::SP_MessageBoxWarning
                                                                            : QStyle::SP_MessageBoxCritical));
    item->setToolTip(0, item->text(0));
  }
  auto* dock = qobject_cast<QDockWidget*>(messages_->parentWidget());
  dock->show();
  dock->raise();
  statusBar()->showMessage(faults == 1 ? tr("%1: 1 fault").arg(tab->title())
                                       : tr("%1: %2 faults").arg(tab->title()).arg(faults));
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
  const int page = tab == nullptr ? 0 : tab->currentPage();
  const int topic = page == 0 ? 0 : tab->editor().helpTopic(page);
  QString error;
  if (!help_->showTopic(topic, page == 0 ? tr("Overview") : tab->caption(page), &error)) tell(error);
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
  unwritten_.erase(tab);
  recovery_.forget(tab->property(kNumber).toInt());
  tabs_->removeTab(index);
  delete tab;
  rebuildWindowMenu();
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
