// The actions that menus, tool bar and start view share, and the latter two.

#include <QApplication>
#include <QToolButton>

#include "shell/main_window.h"
#include "shell/tool_icons.h"

namespace gridbay::shell {
namespace {

// "Undo Drying depth (Ctrl+Z)"
QString tipOf(const QAction& action) {
  const QString key = action.shortcut().toString(QKeySequence::NativeText);
  QString text = action.text();
  text.replace("&&", "\n").remove('&').replace('\n', '&');
  while (text.endsWith('.') || text.endsWith(' ')) text.chop(1);
  return key.isEmpty() ? text : QString("%1 (%2)").arg(text, key);
}

}  // namespace

void MainWindow::buildActions() {
  const auto make = [this](Tool tool, const QString& text, const QKeySequence& key, auto&& act) {
    auto* action = new QAction(toolIcon(tool), text, this);
    action->setShortcut(key);
    action->setToolTip(tipOf(*action));
    connect(action, &QAction::triggered, this, act);
    return action;
  };
  for (std::size_t i = 0; i < libraries_.size(); ++i) {
    const QString name = libraries_[i]->docString(CVdDocTemplate::kNewFileName);
    fresh_.push_back(make(Tool::fresh, name, i == 0 ? QKeySequence(QKeySequence::New) : QKeySequence(),
                          [this, i] { newDocument(i); }));
    fresh_.back()->setIconText(tr("New %1").arg(name));
    const QString key = fresh_.back()->shortcut().toString(QKeySequence::NativeText);
    fresh_.back()->setToolTip(fresh_.back()->iconText() + (key.isEmpty() ? "" : " (" + key + ")"));
  }
  open_ = make(Tool::open, tr("&Open..."), QKeySequence::Open, [this] { askOpen(); });
  open_->setIconText(tr("Open"));
  save_ = make(Tool::save, tr("&Save"), QKeySequence::Save, [this] { saveDocument(); });
  saveAs_ = make(Tool::save, tr("Save &As..."), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_S),
                 [this] { askSave(); });
  saveAs_->setIcon({});
  undo_ = make(Tool::undo, tr("&Undo"), QKeySequence::Undo, [this] {
    if (DocumentTab* tab = currentDocument()) tab->undo();
  });
  redo_ = make(Tool::redo, tr("&Redo"), QKeySequence::Redo, [this] {
    if (DocumentTab* tab = currentDocument()) tab->redo();
  });
  helpOnPage_ = make(Tool::help, tr("&Help on this page"), QKeySequence(Qt::Key_F1), [this] { showHelp(); });
  helpOnPage_->setIconText(tr("Help"));
  commandAction(DocumentTab::kValidate)->setText(tr("&Validate"));
  commandAction(DocumentTab::kStart)->setText(tr("&Start simulation"));
}

QAction* MainWindow::commandAction(int id) {
  QAction*& action = commands_[id];
  if (action != nullptr) return action;
  action = new QAction(this);
  if (id == DocumentTab::kValidate) action->setShortcut(Qt::Key_F7);
  if (id == DocumentTab::kValidate) action->setIcon(toolIcon(Tool::validate));
  if (id == DocumentTab::kStart) action->setShortcut(Qt::Key_F5);
  if (id == DocumentTab::kStart) action->setIcon(toolIcon(Tool::start));
  connect(action, &QAction::triggered, this, [this, id] {
    if (DocumentTab* tab = currentDocument()) tab->runCommand(id);
    rebuildRunMenu();
  });
  return action;
}

void MainWindow::buildTools() {
  tools_ = addToolBar(tr("Tools"));
  tools_->setObjectName("tools");
  tools_->setMovable(false);
  tools_->addAction(fresh_.front());
  tools_->addAction(open_);
  tools_->addAction(save_);
  tools_->addSeparator();
  tools_->addAction(undo_);
  tools_->addAction(redo_);
  tools_->addSeparator();
  tools_->addAction(commandAction(DocumentTab::kValidate));
  tools_->addAction(commandAction(DocumentTab::kStart));
  tools_->addSeparator();
  tools_->addAction(units_->menuAction());
  tools_->addAction(helpOnPage_);
  units_->menuAction()->setIcon(toolIcon(Tool::units));
  units_->menuAction()->setToolTip(tr("Units that quantities are shown in"));
  const auto buttonOf = [this](QAction* action) {
    return static_cast<QToolButton*>(tools_->widgetForAction(action));
  };
  buttonOf(units_->menuAction())->setPopupMode(QToolButton::InstantPopup);
  buttonOf(fresh_.front())->setMenu(freshMenu_);
  buttonOf(fresh_.front())->setPopupMode(QToolButton::MenuButtonPopup);
  // A desktop that shows menus without pictures still has them in the tool bar.
  for (QAction* action : tools_->actions()) action->setIconVisibleInMenu(false);
  refreshActions();
}

void MainWindow::buildStartView() {
  for (std::size_t i = 0; i < fresh_.size(); ++i)
    start_->addBeginning(fresh_[i], libraries_[i]->docString(CVdDocTemplate::kFilterLabel));
  start_->addBeginning(open_, tr("A setup, or a data file to look at"));
  start_->addBeginning(helpOnPage_, tr("What a setup is made of, and in what order"));
  connect(start_, &StartView::recentChosen, this, &MainWindow::openRecent);
}

void MainWindow::refreshActions() {
  DocumentTab* tab = currentDocument();
  const auto show = [](QAction* action, const QString& verb, const std::optional<SetupEditor::Edit>& edit) {
    action->setEnabled(edit.has_value());
    action->setText(edit ? verb + " " + QString::fromStdString(edit->name).replace('&', "&&") : verb);
    action->setToolTip(tipOf(*action));
  };
  show(undo_, tr("&Undo"), tab == nullptr ? std::nullopt : tab->editor().undoable());
  show(redo_, tr("&Redo"), tab == nullptr ? std::nullopt : tab->editor().redoable());
  for (QAction* action : {save_, saveAs_, close_, summary_, compareWith_}) action->setEnabled(tab != nullptr);
  for (const auto& [id, action] : commands_) {
    action->setEnabled(tab != nullptr);
    action->setToolTip(tipOf(*action));
  }
}

}  // namespace gridbay::shell
