#pragma once

#include <QObject>
#include <QSocketNotifier>
#include <QString>
#include <QTimer>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>

#include "platform/work_apart.h"

namespace gridbay::shell {

// Long work beside the window, a piece at a time. A new piece takes the place of one that is not done. It
// begins once no library is at work in a thread, for which the window does not wait.
class BackgroundWork final : public QObject {
  Q_OBJECT
 public:
  explicit BackgroundWork(QObject* parent);

  // `file` is the one that it makes; empty for none.
  void begin(const WorkApart::Work& work, const QString& file = {});
  bool isRunning() const { return work_ != nullptr || retry_.isActive(); }
  // Stops the work and waits for its end; what it would have told is not told any more.
  void stop();

 signals:
  // How much is done, 0 to 1.
  void progressed(double done);
  // What the work has handed back; nothing where it has ended by a crash, or could not be begun.
  void ended(const std::optional<std::string>& text);

 private:
  void tryToBegin();
  void take();

  WorkApart::Work wanted_;  // and not begun
  QString file_;
  QTimer retry_;
  std::unique_ptr<WorkApart> work_;
  std::unique_ptr<QSocketNotifier> notifier_;
  std::uint64_t round_ = 0;  // one more at each stop: what is of an earlier one is not told
};

}  // namespace gridbay::shell
