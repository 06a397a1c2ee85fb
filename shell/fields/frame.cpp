#include "shell/fields/frame.h"

#include <QPainter>

#include "shell/shades.h"

namespace gridbay::shell {

Frame::Frame(QWidget* parent) : QGroupBox(parent) {}

QFont Frame::titleFont() const {
  QFont bold = font();
  bold.setWeight(QFont::DemiBold);
  return bold;
}

QSize Frame::withTitle(const QSize& size) const {
  constexpr int kAround = 12;
  const int width = QFontMetrics(titleFont()).size(Qt::TextShowMnemonic, title()).width() + kAround;
  return size.expandedTo(QSize(width, 0));
}

QSize Frame::minimumSizeHint() const {
  return withTitle(QGroupBox::minimumSizeHint());
}
QSize Frame::sizeHint() const {
  return withTitle(QGroupBox::sizeHint());
}

void Frame::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const QColor window = palette().color(QPalette::Active, QPalette::Window);
  const QColor text = palette().color(QPalette::Active, QPalette::WindowText);
  constexpr int kEdge = 3;  // that the style keeps free around the contents
  const QRectF card = QRectF(contentsRect()).adjusted(-kEdge + 0.5, -kEdge + 0.5, kEdge - 0.5, kEdge - 0.5);
  painter.setPen(QPen(blend(window, text, isDark(palette()) ? 0.24 : 0.2), 1));
  painter.setBrush(isDark(palette()) ? blend(window, text, 0.03) : blend(window, Qt::white, 0.45));
  painter.drawRoundedRect(card, 4, 4);
  painter.setFont(titleFont());
  painter.setPen(palette().color(isEnabled() ? QPalette::Active : QPalette::Disabled, QPalette::WindowText));
  painter.drawText(QRectF(card.left() + 1, 0, width(), card.top() - 2),
                   Qt::AlignLeft | Qt::AlignVCenter | Qt::TextShowMnemonic, title());
}

}  // namespace gridbay::shell
