#include "shell/map/dialog_aside.h"

#include <QCoreApplication>
#include <QEvent>
#include <utility>

namespace gridbay::shell {
namespace {

bool isOfUser(QEvent::Type type) {
  switch (type) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::Wheel:
    case QEvent::TouchBegin:
    case QEvent::TabletPress:
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::Shortcut:
    case QEvent::ContextMenu:
    case QEvent::DragEnter:
    case QEvent::Drop:
    case QEvent::Close:
      return true;
    default:
      return false;
  }
}

}  // namespace

DialogAside::DialogAside(QDialog& dialog, QWidget& map) : dialog_(&dialog), map_(map), place_(dialog.pos()) {
  dialog.hide();
  qApp->installEventFilter(this);
}

DialogAside::~DialogAside() {
  qApp->removeEventFilter(this);
  if (dialog_ == nullptr) return;
  dialog_->move(place_);
  dialog_->show();
  dialog_->activateWindow();
}

// The map, and what stands above all windows, as a question.
bool DialogAside::isFree(const QObject* target) const {
  for (; target != nullptr; target = target->parent()) {
    const auto* widget = qobject_cast<const QWidget*>(target);
    if (target == &map_ || (widget != nullptr && widget->isWindow() && widget->isModal())) return true;
  }
  return false;
}

bool DialogAside::eventFilter(QObject* watched, QEvent* event) {
  const bool isForWidget = watched->isWidgetType() || event->type() == QEvent::Shortcut;
  if (!isOfUser(event->type()) || !isForWidget || isFree(watched)) return false;
  // What the map leaves comes back here from the widgets around it.
  if (event->type() == QEvent::KeyPress && !std::exchange(isPassedOn_, true)) {
    const QPointer<DialogAside> self(this);  // the key may end the pick, and this with it
    QCoreApplication::sendEvent(&map_, event);
    if (self != nullptr) isPassedOn_ = false;
  }
  event->setAccepted(event->type() != QEvent::Close && event->type() != QEvent::DragEnter);
  return true;
}

}  // namespace gridbay::shell
