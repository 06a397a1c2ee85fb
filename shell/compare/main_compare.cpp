// Comparing and merging, as the window does them.

#include <QFileDialog>
#include <QFileInfo>
#include <QStatusBar>

#include "shell/compare/merge_dialog.h"
#include "shell/compare/merge_files_dialog.h"
#include "shell/compare/work_beside.h"
#include "shell/main_window.h"

namespace gridbay::shell {
namespace {

QString setupFilter(const std::string& kind) {
  return MainWindow::tr("Setups (*.%1);;All files (*)").arg(QString::fromStdString(kind));
}

}  // namespace

bool MainWindow::compareWith(const QString& path) {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return false;
  const QString fault = TabComparison::begin(*tab, path);
  compare_->showDocument(tab);
  if (!fault.isEmpty()) {
    tell(fault);
    return false;
  }
  compare_->show();
  compare_->raise();
  // Some differences at a glance.
  constexpr int kHeight = 220;
  if (!compare_->isFloating() && compare_->height() < kHeight)
    resizeDocks({compare_}, {kHeight}, Qt::Vertical);
  return true;
}

// What was chosen in a dialog, or else what the first has, is made of the setups.
bool MainWindow::mergeInto(DocumentTab& tab, const QString& base, const QString& own, const QString& other) {
  SetupComparison& setups = tab.editor().comparison();
  std::string fault = setups.startMerge(base.toStdString(), own.toStdString(), other.toStdString());
  if (fault.empty() && !setups.questions().empty()) {
    bool isCancelled = false;
    const std::optional<std::string> words =
        workBeside([&setups](const WorkApart::Progress&) { return setups.wordQuestions(); },
                   tr("Merging %1...").arg(QFileInfo(other).fileName()), &tab, isCancelled);
    if (isCancelled) return false;
    // Where there are no words for them they are asked by their paths.
    if (words) setups.takeQuestions(*words);
    const QString ownName = own.isEmpty() ? tab.name() : QFileInfo(own).fileName();
    const QString otherName = QFileInfo(other).fileName();
    MergeDialog dialog(ownName, ownName == otherName ? other : otherName, setups.questions(), this);
    if (dialog.exec() != QDialog::Accepted) return false;
  }
  if (fault.empty()) fault = setups.finishMerge();
  tab.editor().refreshPage();
  tab.pane().refresh();
  if (!fault.empty()) tell(QString::fromStdString(fault));
  return fault.empty();
}

bool MainWindow::merge(const QString& base, const QString& own, const QString& other) {
  DocumentTab* shown = currentDocument();
  if (own.isEmpty() && shown == nullptr) return false;
  DocumentTab* tab = shown;
  if (own.isEmpty()) {
    tab->commit();
  } else {
    tab = newDocument(libraryOf(own));
  }
  const bool isDone = mergeInto(*tab, base, own, other);
  if (isDone) {
    statusBar()->showMessage(tr("Merged %1").arg(other), 3000);
  } else if (!own.isEmpty()) {
    discardTab(tab);
    if (shown != nullptr) tabs_->setCurrentWidget(shown);
  }
  return isDone;
}

void MainWindow::askCompare() {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return;
  const QString path =
      QFileDialog::getOpenFileName(this, tr("Compare with"), {}, setupFilter(tab->editor().fileKind()));
  if (!path.isEmpty()) compareWith(path);
}

void MainWindow::askMerge() {
  DocumentTab* tab = currentDocument();
  MergeFilesDialog dialog(tab == nullptr ? QString() : tab->title(),
                          setupFilter(tab == nullptr ? "v27" : tab->editor().fileKind()), this);
  if (dialog.exec() == QDialog::Accepted) merge(dialog.base(), dialog.own(), dialog.other());
}

}  // namespace gridbay::shell
