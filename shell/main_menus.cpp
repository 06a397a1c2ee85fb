// The menus of the window.

#include <QApplication>
#include <QFileDialog>
#include <QMenuBar>
#include <QMessageBox>

#include "shell/appearance.h"
#include "shell/main_window.h"

namespace gridbay::shell {
namespace {

// Commands of the editor that have a key here.
constexpr int kValidate = 46019;
constexpr int kStart = 46018;

// Edits, grids and texts each have slots of these names.
void toFocused(const char* slot) {
  QWidget* focused = QApplication::focusWidget();
  if (focused != nullptr && focused->metaObject()->indexOfMethod(QByteArray(slot) + "()") >= 0)
    QMetaObject::invokeMethod(focused, slot);
}

}  // namespace

void MainWindow::buildMenus() {
  menuBar()->addMenu(buildFileMenu());
  menuBar()->addMenu(buildEditMenu());
  menuBar()->addMenu(buildViewMenu());
  runMenu_ = menuBar()->addMenu(tr("&Run"));
  rebuildRunMenu();
  menuBar()->addMenu(buildWindowMenu());
  menuBar()->addMenu(buildHelpMenu());
}

QMenu* MainWindow::buildFileMenu() {
  auto* file = new QMenu(tr("&File"), this);
  QMenu* fresh = file->addMenu(tr("&New"));
  for (std::size_t i = 0; i < libraries_.size(); ++i) {
    QAction* action = fresh->addAction(libraries_[i]->docString(CVdDocTemplate::kNewFileName), this,
                                       [this, i] { newDocument(i); });
    if (i == 0) action->setShortcut(QKeySequence::New);
  }
  file->addAction(tr("&Open..."), QKeySequence::Open, this, [this] { askOpen(); });
  recentMenu_ = file->addMenu(tr("Open &Recent"));
  rebuildRecentMenu();
  file->addAction(tr("&Close"), QKeySequence::Close, this, [this] { closeTab(tabs_->currentIndex()); });
  file->addSeparator();
  file->addAction(tr("&Save"), QKeySequence::Save, this, [this] { saveDocument(); });
  file->addAction(tr("Save &As..."), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_S), this,
                  [this] { askSave(); });
  file->addSeparator();
  file->addAction(tr("E&xit"), QKeySequence::Quit, this, &QWidget::close);
  return file;
}

QMenu* MainWindow::buildEditMenu() {
  auto* edit = new QMenu(tr("&Edit"), this);
  undo_ = edit->addAction(tr("&Undo"), QKeySequence::Undo, this, [this] {
    if (DocumentTab* tab = currentDocument()) tab->undo();
  });
  redo_ = edit->addAction(tr("&Redo"), QKeySequence::Redo, this, [this] {
    if (DocumentTab* tab = currentDocument()) tab->redo();
  });
  edit->addSeparator();
  edit->addAction(tr("Cu&t"), this, [] { toFocused("cut"); });
  edit->addAction(tr("&Copy"), this, [] { toFocused("copy"); });
  edit->addAction(tr("&Paste"), this, [] { toFocused("paste"); });
  refreshEditMenu();
  return edit;
}

void MainWindow::refreshEditMenu() {
  DocumentTab* tab = currentDocument();
  const auto show = [](QAction* action, const QString& verb, const std::optional<SetupEditor::Edit>& edit) {
    action->setEnabled(edit.has_value());
    action->setText(edit ? verb + " " + QString::fromStdString(edit->name).replace('&', "&&") : verb);
  };
  show(undo_, tr("&Undo"), tab == nullptr ? std::nullopt : tab->editor().undoable());
  show(redo_, tr("&Redo"), tab == nullptr ? std::nullopt : tab->editor().redoable());
}

QMenu* MainWindow::buildViewMenu() {
  auto* view = new QMenu(tr("&View"), this);
  units_ = new UnitsMenu(this);
  view->addMenu(units_);
  connect(units_, &UnitsMenu::unitsChosen, this, [this] {
    for (int i = 0; i < tabs_->count(); ++i)
      static_cast<DocumentTab*>(tabs_->widget(i))->setUnits(units_->units());
  });
  view->addMenu(makeAppearanceMenu(this));
  view->addSeparator();
  view->addAction(tr("&Previous page"), QKeySequence(Qt::CTRL | Qt::Key_PageUp), this, [this] {
    if (DocumentTab* tab = currentDocument()) tab->goToNeighbour(-1);
  });
  view->addAction(tr("&Next page"), QKeySequence(Qt::CTRL | Qt::Key_PageDown), this, [this] {
    if (DocumentTab* tab = currentDocument()) tab->goToNeighbour(1);
  });
  view->addSeparator();
  for (QDockWidget* dock : findChildren<QDockWidget*>()) view->addAction(dock->toggleViewAction());
  return view;
}

QMenu* MainWindow::buildWindowMenu() {
  windowMenu_ = new QMenu(tr("&Window"), this);
  rebuildWindowMenu();
  return windowMenu_;
}

void MainWindow::rebuildWindowMenu() {
  windowMenu_->clear();
  const auto step = [this](int by) {
    if (tabs_->count() > 0)
      tabs_->setCurrentIndex((tabs_->currentIndex() + by + tabs_->count()) % tabs_->count());
  };
  windowMenu_->addAction(tr("&Next"), QKeySequence(Qt::CTRL | Qt::Key_Tab), this, [step] { step(1); });
  windowMenu_->addAction(tr("&Previous"), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_Tab), this,
                         [step] { step(-1); });
  windowMenu_->addSeparator();
  for (int i = 0; i < tabs_->count(); ++i) {
    QAction* action = windowMenu_->addAction(QString("&%1 %2").arg(i + 1).arg(tabs_->tabText(i)), this,
                                             [this, i] { tabs_->setCurrentIndex(i); });
    action->setCheckable(true);
    action->setChecked(i == tabs_->currentIndex());
  }
}

QMenu* MainWindow::buildHelpMenu() {
  auto* help = new QMenu(tr("&Help"), this);
  help->addAction(tr("&Help on this page"), QKeySequence(Qt::Key_F1), this, [this] { showHelp(); });
  help->addAction(tr("&Overview"), this, [this] {
    QString error;
    if (!help_->showTopic(0, tr("Overview"), &error)) tell(error);
  });
  help->addSeparator();
  help->addAction(tr("&About"), this, [this] {
    QMessageBox::about(this, QApplication::applicationDisplayName(),
                       tr("The setup editor of a two-dimensional free-surface flow model on nested grids."));
  });
  return help;
}

void MainWindow::rebuildRunMenu() {
  runMenu_->clear();
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return;
  for (const SetupEditor::Command& command : tab->editor().commands()) {
    QAction* action =
        runMenu_->addAction(QString::fromStdString(command.text), this, [this, id = command.id] {
          DocumentTab* current = currentDocument();
          if (current == nullptr) return;
          current->commit();
          current->editor().command(id);
          // A command that starts another thing shows no check mark and needs no new menu.
          rebuildRunMenu();
        });
    action->setCheckable(command.checked);
    action->setChecked(command.checked);
    if (command.id == kValidate) action->setShortcut(Qt::Key_F7);
    if (command.id == kStart) action->setShortcut(Qt::Key_F5);
  }
  runMenu_->addAction(tr("S&top simulation"), QKeySequence(Qt::SHIFT | Qt::Key_F5), this,
                      [this] { run_->stop(); });
}

void MainWindow::askOpen() {
  QStringList filters;
  for (const auto& library : libraries_) filters << library->docString(CVdDocTemplate::kFilterLabel);
  filters << tr("Data files (*.tsb0 *.tsb1 *.tsb2)");
  const QString path = QFileDialog::getOpenFileName(this, {}, {}, filters.join(";;"));
  if (path.isEmpty()) return;
  if (DataWindow::isDataFile(path)) {
    openData(path);
  } else {
    openDocument(path);
  }
}

}  // namespace gridbay::shell
