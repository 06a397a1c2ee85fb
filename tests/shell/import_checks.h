#pragma once

#include <QAbstractButton>
#include <QDropEvent>
#include <QLabel>
#include <QMimeData>
#include <QTest>
#include <QUrl>
#include <QWidget>

namespace gridbay::shell {

// What the windows that bring files in have in common.

// Each input with a label has a key to it, and no key leads to two.
inline void checkAccelerators(QWidget& window) {
  QStringList texts;
  for (const QLabel* label : window.findChildren<QLabel*>()) {
    if (label->buddy() == nullptr || label->window() != &window) continue;
    QVERIFY2(label->text().contains('&'), qPrintable(label->text()));
    texts << label->text();
  }
  for (const QAbstractButton* button : window.findChildren<QAbstractButton*>()) {
    if (button->window() == &window && button->text().contains('&')) texts << button->text();
  }
  QMap<QChar, QString> taken;
  for (const QString& text : texts) {
    const QChar key = text[text.indexOf('&') + 1].toUpper();
    QVERIFY2(!taken.contains(key), qPrintable(text + " and " + taken[key]));
    taken[key] = text;
  }
  QVERIFY(taken.size() > 8);
}

// Drags files over a window and lets them go there, where it takes them.
inline void drop(QWidget& window, const QList<QUrl>& files, bool isTaken) {
  QMimeData dropped;
  dropped.setUrls(files);
  QDragEnterEvent enter(QPoint(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
  QApplication::sendEvent(&window, &enter);
  QCOMPARE(enter.isAccepted(), isTaken);
  QDropEvent let(QPointF(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
  QApplication::sendEvent(&window, &let);
}

}  // namespace gridbay::shell
