// The series that is written from what was read.

#include <QDir>
#include <QFileInfo>
#include <QMessageBox>

#include "platform/files/may_write.h"
#include "shell/import/series_import.h"
#include "shell/import/work_host.h"
#include "shell/work_results.h"

namespace gridbay::shell {
namespace {

// What a time series of the form holds, as the user has named it.
SeriesTable namedItems(SeriesTable table, const TableForm& form) {
  std::size_t item = 0;
  for (const TableColumn& column : form.columns) {
    if (column.role == TableColumn::Role::item) table.items[item++] = column;
  }
  return table;
}

}  // namespace

bool SeriesImport::mayReplace(const QString& path) {
  if (!QFileInfo::exists(path)) return true;
  return QMessageBox::question(this, windowTitle(), tr("%1 is there already. Replace it?").arg(path)) ==
         QMessageBox::Yes;
}

// What was typed last is read first.
void SeriesImport::startImport() {
  reading_.readChanged();
  isWanted_ = reading_.isBusy();
  if (isWanted_ || work_.isRunning() || !import_->isEnabled()) return;
  QString path = QFileInfo(setup_.folder.isEmpty() ? QDir() : QDir(setup_.folder), result_->text().trimmed())
                     .absoluteFilePath();
  if (!path.endsWith(".tsb0")) path += ".tsb0";
  const std::string source = source_.toStdString();
  const Outcome free = mayWrite(path.toStdString(), true, {&source, source_.isEmpty() ? 0U : 1U}, {});
  if (!free) {
    tell(QString::fromStdString(free.error()), true);
    result_->setFocus();
    return;
  }
  if (mayReplace(path)) write(path);
}

void SeriesImport::write(const QString& path) {
  made_ = path;
  before_ = fileStamp(made_.toStdString());
  uses_->hide();
  const SeriesTarget target{.out = path.toStdString(),
                            .title = QFileInfo(title_).completeBaseName().toStdString(),
                            .history = tr("Import Series (%1)").arg(title_).toStdString()};
  work_.begin(
      [this, target](const WorkApart::Progress& progress) {
        WorkHost host(progress);
        return packed(writeSeriesTable(namedItems(*table(), reading_.form()), target, host));
      },
      made_);
  showStage();
}

void SeriesImport::takeImport(const std::optional<std::string>& bytes) {
  showStage();
  const Result<std::string> summary =
      bytes ? unpackedSummary(*bytes) : Failure{"The import came to a sudden end; nothing is written"};
  if (!summary) {
    tell(QString::fromStdString(summary.error()), true);
    return;
  }
  const QString told = QString::fromStdString(*summary).trimmed();
  tell(told, false);
  emit imported(told);
  takeSetup();
  uses_->offer(made_);
}

void SeriesImport::cancel() {
  if (!work_.isRunning()) {
    isWanted_ = false;
    return reading_.stopRecognising();
  }
  work_.stop();
  showStage();
  tell(fileStamp(made_.toStdString()) == before_
           ? tr("The import was stopped; nothing is written.")
           : tr("%1 was written before the import could be stopped.").arg(made_),
       false);
}

}  // namespace gridbay::shell
