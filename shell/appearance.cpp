#include "shell/appearance.h"

#include <QActionGroup>
#include <QApplication>
#include <QPalette>
#include <QSettings>
#include <QToolTip>

#include "shell/clear_style.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr const char* kKey = "appearance";

QPalette paletteOf(bool dark) {
  const QColor window = dark ? QColor(0x2B, 0x2D, 0x30) : QColor(0xF3, 0xF3, 0xF3);
  const QColor base = dark ? QColor(0x1E, 0x1F, 0x22) : QColor(Qt::white);
  const QColor text = dark ? QColor(0xE6, 0xE6, 0xE6) : QColor(0x1A, 0x1A, 0x1A);
  const QColor faint = dark ? QColor(0x80, 0x82, 0x86) : QColor(0x8A, 0x8A, 0x8A);
  const QColor highlight(dark ? QColor(0x35, 0x74, 0xC0) : QColor(0x2A, 0x6F, 0xC9));
  QPalette palette(window);
  palette.setColor(QPalette::Window, window);
  palette.setColor(QPalette::Base, base);
  palette.setColor(QPalette::AlternateBase, window);
  palette.setColor(QPalette::ToolTipBase, base);
  palette.setColor(QPalette::Button, window);
  palette.setColor(QPalette::Highlight, highlight);
  palette.setColor(QPalette::HighlightedText, Qt::white);
  palette.setColor(QPalette::Link, dark ? QColor(0x6C, 0xA9, 0xF0) : QColor(0x1A, 0x5F, 0xB4));
  for (const auto role :
       {QPalette::WindowText, QPalette::Text, QPalette::ButtonText, QPalette::ToolTipText}) {
    palette.setColor(role, text);
    palette.setColor(QPalette::Disabled, role, faint);
  }
  palette.setColor(QPalette::PlaceholderText, faint);
  palette.setColor(QPalette::Disabled, QPalette::Base, disabledGround(palette));
  palette.setColor(QPalette::Disabled, QPalette::Highlight, faint);
  return palette;
}

}  // namespace

void setAppearance(Appearance appearance) {
  if (appearance == Appearance::desktop) {
    QApplication::setPalette(QPalette());
    QToolTip::setPalette(QPalette());
    return;
  }
  const QPalette palette = paletteOf(appearance == Appearance::dark);
  QApplication::setStyle(new ClearStyle());
  QApplication::setPalette(palette);
  QToolTip::setPalette(palette);
}

QMenu* makeAppearanceMenu(QWidget* parent) {
  auto* menu = new QMenu(QObject::tr("&Appearance"), parent);
  auto* group = new QActionGroup(menu);
  const int kept = QSettings().value(kKey).toInt();
  const QStringList names{QObject::tr("As the &desktop"), QObject::tr("&Light"), QObject::tr("Da&rk")};
  for (int i = 0; i < names.size(); ++i) {
    QAction* action = menu->addAction(names[i], parent, [i] {
      QSettings().setValue(kKey, i);
      setAppearance(static_cast<Appearance>(i));
    });
    action->setCheckable(true);
    action->setChecked(i == kept);
    group->addAction(action);
  }
  if (kept != 0) setAppearance(static_cast<Appearance>(qBound(0, kept, 2)));
  return menu;
}

}  // namespace gridbay::shell
