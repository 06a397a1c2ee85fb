// The menus of the window.

#include <QApplication>
#include <QFileDialog>
#include <QMenuBar>
#include <QMessageBox>

#include "shell/appearance.h"
#include "shell/main_window.h"

namespace gridbay::shell {
namespace {

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
  freshMenu_ = file->addMenu(tr("&New"));
  for (QAction* action : fresh_) freshMenu_->addAction(action);
  file->addAction(open_);
  recentMenu_ = file->addMenu(tr("Open &Recent"));
  rebuildRecentMenu();
  close_ =
      file->addAction(tr("&Close"), QKeySequence::Close, this, [this] { closeTab(tabs_->currentIndex()); });
  file->addSeparator();
  file->addAction(save_);
  file->addAction(saveAs_);
  file->addSeparator();
  file->addAction(tr("Import &Terrain..."), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_T), this,
                  [this] { importTerrain(); });
  file->addAction(tr("Import &Series..."), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_I), this,
                  &MainWindow::importSeries);
  file->addSeparator();
  compareWith_ = file->addAction(tr("Compare &With..."), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_D), this,
                                 [this] { askCompare(); });
  merge_ = file->addAction(tr("&Merge..."), this, [this] { askMerge(); });
  file->addSeparator();
  file->addAction(tr("E&xit"), QKeySequence::Quit, this, &QWidget::close);
  return file;
}

QMenu* MainWindow::buildEditMenu() {
  auto* edit = new QMenu(tr("&Edit"), this);
  edit->addAction(undo_);
  edit->addAction(redo_);
  edit->addSeparator();
  edit->addAction(tr("Cu&t"), this, [] { toFocused("cut"); });
  edit->addAction(tr("&Copy"), this, [] { toFocused("copy"); });
  edit->addAction(tr("&Paste"), this, [] { toFocused("paste"); });
  return edit;
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
  summary_ = view->addAction(tr("&Summary of the setup"), QKeySequence(Qt::ALT | Qt::Key_Home), this, [this] {
    if (DocumentTab* tab = currentDocument()) tab->showFirstView();
  });
  view->addSeparator();
  for (QAction* action : {compare_->nextAction(), compare_->previousAction(), compare_->takeAction(),
                          compare_->takePageAction(), compare_->takeAllAction()})
    view->addAction(action);
  view->addSeparator();
  for (QDockWidget* dock : findChildren<QDockWidget*>()) view->addAction(dock->toggleViewAction());
  view->addAction(map_->pickAction());
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
  help->addAction(helpOnPage_);
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
    QAction* action = commandAction(command.id);
    action->setText(QString::fromStdString(command.text));
    action->setCheckable(command.checked);
    action->setChecked(command.checked);
    runMenu_->addAction(action);
  }
  runMenu_->addAction(tr("S&top simulation"), QKeySequence(Qt::SHIFT | Qt::Key_F5), this,
                      [this] { run_->stop(); });
  refreshActions();
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
