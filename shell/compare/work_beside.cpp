#include "shell/compare/work_beside.h"

#include <QEventLoop>
#include <QProgressDialog>
#include <QTimer>

namespace gridbay::shell {

bool waitFor(BackgroundWork& work, const QString& title, QWidget* parent) {
  if (!work.isRunning()) return true;
  constexpr int kMoment = 500;  // milliseconds
  QEventLoop quiet;
  QObject::connect(&work, &BackgroundWork::ended, &quiet, &QEventLoop::quit);
  QTimer::singleShot(kMoment, &quiet, &QEventLoop::quit);
  quiet.exec(QEventLoop::ExcludeUserInputEvents);
  if (!work.isRunning()) return true;
  QProgressDialog dialog(title, QProgressDialog::tr("Cancel"), 0, 0, parent);
  dialog.setWindowModality(Qt::ApplicationModal);
  QEventLoop loop;
  QObject::connect(&work, &BackgroundWork::ended, &loop, &QEventLoop::quit);
  QObject::connect(&dialog, &QProgressDialog::canceled, &loop, &QEventLoop::quit);
  dialog.show();
  loop.exec();
  const bool isCancelled = work.isRunning();
  work.stop();
  return !isCancelled;
}

std::optional<std::string> workBeside(const WorkApart::Work& work, const QString& title, QWidget* parent,
                                      bool& isCancelled) {
  BackgroundWork beside(nullptr);
  std::optional<std::string> made;
  QObject::connect(&beside, &BackgroundWork::ended, &beside,
                   [&](const std::optional<std::string>& text) { made = text; });
  beside.begin(work);
  isCancelled = !waitFor(beside, title, parent);
  return made;
}

}  // namespace gridbay::shell
