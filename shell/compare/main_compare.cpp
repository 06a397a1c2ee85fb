// Comparing and merging, as the window does them.

#include <QFileDialog>
#include <QFileInfo>
#include <QStatusBar>

#include "shell/compare/merge_dialog.h"
#include "shell/main_window.h"

namespace gridbay::shell {
namespace {

QString askSetup(QWidget* parent, const QString& title, const std::string& kind) {
  return QFileDialog::getOpenFileName(
      parent, title, {}, MainWindow::tr("Setups (*.%1);;All files (*)").arg(QString::fromStdString(kind)));
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
  return true;
}

bool MainWindow::mergeWith(const QString& base, const QString& other) {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return false;
  tab->commit();
  SetupComparison& comparison = tab->editor().comparison();
  if (const std::string fault = comparison.startMerge(base.toStdString(), other.toStdString());
      !fault.empty()) {
    tell(QString::fromStdString(fault));
    return false;
  }
  if (!comparison.questions().empty()) {
    MergeDialog dialog(tab->name(), QFileInfo(other).fileName(), comparison.questions(), this);
    if (dialog.exec() != QDialog::Accepted) return false;
  }
  const std::string fault = comparison.finishMerge();
  tab->editor().refreshPage();
  tab->pane().refresh();
  if (!fault.empty()) {
    tell(QString::fromStdString(fault));
    return false;
  }
  statusBar()->showMessage(tr("Merged %1").arg(other), 3000);
  return true;
}

void MainWindow::askCompare() {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return;
  const QString path = askSetup(this, tr("Compare with"), tab->editor().fileKind());
  if (!path.isEmpty()) compareWith(path);
}

void MainWindow::askMerge() {
  DocumentTab* tab = currentDocument();
  if (tab == nullptr) return;
  const std::string kind = tab->editor().fileKind();
  const QString other = askSetup(this, tr("Merge: the other setup"), kind);
  if (other.isEmpty()) return;
  const QString base = askSetup(this, tr("Merge: the setup that both come from"), kind);
  if (!base.isEmpty()) mergeWith(base, other);
}

}  // namespace gridbay::shell
