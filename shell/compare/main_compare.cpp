// Comparing and merging, as the window does them.

#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
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

// What a merge will leave out of the second setup; empty for nothing.
QString leftOutText(const SetupMerging& merging, const QString& other) {
  QStringList sections;
  for (const std::string& path : merging.leftOut()) sections << QString::fromStdString(path);
  if (sections.isEmpty()) return {};
  return MainWindow::tr("This version does not know %1 of %2: the merge leaves it out.")
      .arg(sections.join(", "), other);
}

// Asks for what is to be chosen, and tells of what will be left out; false to merge nothing.
bool askChoices(SetupMerging& merging, const QString& own, const QString& other, QWidget* parent) {
  const QString leftOut = leftOutText(merging, other);
  if (!merging.questions().empty())
    return MergeDialog(own, other, merging.questions(), leftOut, parent).exec() == QDialog::Accepted;
  return leftOut.isEmpty() ||
         QMessageBox::question(parent, MainWindow::tr("Merge"),
                               MainWindow::tr("%1\n\nMerge all the same?").arg(leftOut)) == QMessageBox::Yes;
}

}  // namespace

bool MainWindow::compareWith(const QString& path) {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return false;
  QString fault;
  const bool isBegun = TabComparison::begin(*tab, path, fault);
  compare_->showDocument(tab);
  if (!fault.isEmpty()) tell(fault);
  if (!isBegun) return false;
  compare_->show();
  compare_->raise();
  // Some differences at a glance.
  constexpr int kHeight = 220;
  if (!compare_->isFloating() && compare_->height() < kHeight)
    resizeDocks({compare_}, {kHeight}, Qt::Vertical);
  return true;
}

// What was chosen in a dialog, or else what the first has, is made of the setups. What takes long goes beside
// the window.
bool MainWindow::mergeInto(DocumentTab& tab, const QString& base, const QString& own, const QString& other) {
  SetupMerging& merging = tab.editor().comparison().merging();
  const QString name = QFileInfo(other).fileName();
  bool isCancelled = false;
  const auto beside = [&](const std::function<std::string()>& work) {
    return workBeside([&work](const WorkApart::Progress&) { return work(); }, tr("Merging %1...").arg(name),
                      &tab, isCancelled);
  };
  const QString suddenEnd = tr("%1 could not be merged: the work came to a sudden end.").arg(name);
  const auto read =
      beside([&] { return merging.read(base.toStdString(), own.toStdString(), other.toStdString()); });
  if (isCancelled) return false;
  QString fault = read ? QString::fromStdString(merging.start(*read)) : suddenEnd;
  if (fault.isEmpty() && !merging.questions().empty()) {
    const auto words = beside([&] { return merging.word(); });
    if (isCancelled) return false;
    // Where there are no words for them they are asked by their paths.
    if (words) merging.takeWords(*words);
  }
  if (fault.isEmpty()) {
    const QString ownName = own.isEmpty() ? tab.name() : QFileInfo(own).fileName();
    if (!askChoices(merging, ownName, ownName == name ? other : name, this)) return false;
    const auto made = beside([&] { return merging.make(); });
    if (isCancelled) return false;
    fault = made ? QString::fromStdString(merging.finish(*made)) : suddenEnd;
  }
  tab.editor().refreshPage();
  tab.pane().refresh();
  if (!fault.isEmpty()) tell(fault);
  return fault.isEmpty();
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
