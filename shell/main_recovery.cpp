// The window's part in the recovery of unsaved edits.

#include <QApplication>
#include <QMessageBox>
#include <QStatusBar>

#include "shell/main_window.h"

namespace gridbay::shell {

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
  for (const Recovery::Left& left : recovery_.left()) offerRecovery(left);
}

void MainWindow::offerRecovery(const Recovery::Left& left) {
  const QString name = left.path.isEmpty() ? tr("a setup that was never saved") : left.path;
  QMessageBox box(QMessageBox::Question, QApplication::applicationDisplayName(),
                  tr("There are unsaved edits of %1, from %2. The program ended before they were saved.")
                      .arg(name, left.time.toString("yyyy-MM-dd hh:mm:ss")),
                  QMessageBox::Open | QMessageBox::Discard | QMessageBox::Ignore, this);
  box.button(QMessageBox::Open)->setText(tr("&Recover"));
  box.button(QMessageBox::Ignore)->setText(tr("&Later"));
  const int answer = box.exec();
  const bool isDone = answer == QMessageBox::Discard || (answer == QMessageBox::Open && recover(left));
  if (isDone) Recovery::discard(left);
}

// Into the tab that the setup is open in already, or else into one of its own. What is not recovered is kept.
bool MainWindow::recover(const Recovery::Left& left) {
  DocumentTab* open = tabOf(left.path);
  if (open != nullptr) {
    open->commit();
    tabs_->setCurrentWidget(open);
    if (open->editor().isModified() &&
        !open->askYesNo(
            tr("%1 is open with other edits that are not saved. Lose them, and take those that were "
               "left behind?")
                .arg(left.path)
                .toStdString()))
      return false;
  }
  DocumentTab* tab = open != nullptr ? open : newDocument(libraryOf(left.extension));
  if (!tab->recover(left.copy, left.path)) {
    if (open == nullptr) discardTab(tab);
    return false;
  }
  writeRecoveryCopies();
  return true;
}

}  // namespace gridbay::shell
