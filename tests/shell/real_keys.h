#pragma once

#include <QAbstractScrollArea>
#include <QApplication>
#include <QTest>

namespace gridbay::shell {

// Where the desktop would send a key: to the popup that is open, or else to the widget that has the focus.
inline QWidget* keyTarget() {
  QWidget* popup = QApplication::activePopupWidget();
  if (popup == nullptr) return QApplication::focusWidget();
  return popup->focusWidget() != nullptr ? popup->focusWidget() : popup;
}

inline void pressKey(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier) {
  QTest::keyClick(keyTarget(), key, modifiers);
}

// Each letter on its own, as the first may open a list that the others go to.
inline void typeKeys(const QString& text) {
  for (const QChar letter : text) QTest::keyClick(keyTarget(), letter.toLatin1());
}

}  // namespace gridbay::shell
