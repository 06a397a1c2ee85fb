#include "shell/import/file_drop.h"

#include <QDropEvent>
#include <QLineEdit>
#include <QMimeData>
#include <QUrl>

namespace gridbay::shell {
namespace {

// The first one that is on this machine; empty for none.
QString fileOf(const QMimeData& dropped) {
  for (const QUrl& url : dropped.urls()) {
    if (url.isLocalFile()) return url.toLocalFile();
  }
  return {};
}

}  // namespace

FileDrop::FileDrop(QWidget& window, std::function<void(const QString& path)> take)
    : QObject(&window), take_(std::move(take)) {
  window.setAcceptDrops(true);
  // They would take its name as a text.
  for (QLineEdit* edit : window.findChildren<QLineEdit*>()) edit->setAcceptDrops(false);
  window.installEventFilter(this);
}

bool FileDrop::eventFilter(QObject* watched, QEvent* event) {
  const bool isDrag = event->type() == QEvent::DragEnter || event->type() == QEvent::DragMove;
  if (!isDrag && event->type() != QEvent::Drop) return QObject::eventFilter(watched, event);
  auto* drop = static_cast<QDropEvent*>(event);
  const QString path = fileOf(*drop->mimeData());
  if (path.isEmpty() || !static_cast<QWidget*>(watched)->isEnabled()) {
    drop->ignore();
    return true;
  }
  drop->acceptProposedAction();
  // Not within the drop, which another program waits for.
  if (!isDrag)
    QMetaObject::invokeMethod(
        this, [this, path] { take_(path); }, Qt::QueuedConnection);
  return true;
}

}  // namespace gridbay::shell
