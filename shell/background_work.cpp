#include "shell/background_work.h"

#include <utility>

#include "platform/no_copy_now.h"

namespace gridbay::shell {

BackgroundWork::BackgroundWork(QObject* parent) : QObject(parent) {
  constexpr int kMoment = 20;  // milliseconds
  retry_.setSingleShot(true);
  retry_.setInterval(kMoment);
  connect(&retry_, &QTimer::timeout, this, &BackgroundWork::tryToBegin);
}

void BackgroundWork::begin(const WorkApart::Work& work, const QString& file) {
  stop();
  wanted_ = work;
  file_ = file;
  tryToBegin();
}

void BackgroundWork::tryToBegin() {
  if (NoCopyNow::isHeld()) return retry_.start();
  Result<WorkApart> begun = WorkApart::begin(std::exchange(wanted_, nullptr), file_.toStdString());
  if (!begun) {
    QMetaObject::invokeMethod(
        this,
        [this, round = round_] {
          if (round == round_) emit ended(std::nullopt);
        },
        Qt::QueuedConnection);
    return;
  }
  work_ = std::make_unique<WorkApart>(std::move(*begun));
  notifier_ = std::make_unique<QSocketNotifier>(work_->descriptor(), QSocketNotifier::Read);
  connect(notifier_.get(), &QSocketNotifier::activated, this, &BackgroundWork::take);
}

void BackgroundWork::stop() {
  ++round_;
  retry_.stop();
  wanted_ = nullptr;
  notifier_.reset();
  work_.reset();
}

void BackgroundWork::take() {
  const bool goesOn = work_->take();
  const double done = work_->done();
  if (goesOn) {
    emit progressed(done);
    return;
  }
  // The notifier is at work, and goes later.
  notifier_->setEnabled(false);
  notifier_.release()->deleteLater();
  const std::optional<std::string> text = std::exchange(work_, nullptr)->text();
  emit ended(text);
}

}  // namespace gridbay::shell
