#include "shell/cover_picture.h"

#include <QPainterPath>
#include <cmath>
#include <numbers>

namespace gridbay::shell {
namespace {

// The drawings' own units; what a rectangle is wider or narrower than that, they go on or are cut at the
// right.
constexpr qreal kHeight = 150;
constexpr qreal kTau = 2 * std::numbers::pi;

struct Colours {
  QColor sky, far, near, line, land, accent;
};

Colours coloursOf(bool dark) {
  if (dark)
    return {QColor(0x1E, 0x2A, 0x36), QColor(0x1F, 0x3F, 0x59), QColor(0x17, 0x30, 0x47),
            QColor(0xA9, 0xC9, 0xE4), QColor(0x3D, 0x54, 0x3A), QColor(0xE0, 0xB0, 0x5A)};
  return {QColor(0xEA, 0xF3, 0xFA), QColor(0xA9, 0xCF, 0xE8), QColor(0x6F, 0xAD, 0xD6),
          QColor(0x1E, 0x4E, 0x79), QColor(0x9C, 0xB8, 0x7C), QColor(0xC9, 0x7A, 0x1E)};
}

// The region below a wavy line at a height.
QPainterPath below(qreal width, qreal level, qreal swell, qreal length, qreal phase) {
  constexpr qreal kStep = 4;
  QPainterPath path(QPointF(0, kHeight));
  for (qreal x = 0; x <= width + kStep; x += kStep)
    path.lineTo(x, level + swell * std::sin(kTau * x / length + phase));
  path.lineTo(width + kStep, kHeight);
  path.closeSubpath();
  return path;
}

void drawGrid(QPainter& painter, const QRectF& area, int columns, int rows, const QColor& colour,
              qreal width) {
  painter.setPen(QPen(colour, width));
  for (int i = 0; i <= columns; ++i) {
    const qreal x = area.left() + area.width() * i / columns;
    painter.drawLine(QPointF(x, area.top()), QPointF(x, area.bottom()));
  }
  for (int i = 0; i <= rows; ++i) {
    const qreal y = area.top() + area.height() * i / rows;
    painter.drawLine(QPointF(area.left(), y), QPointF(area.right(), y));
  }
}

// A coast, and three grids each finer than the one around it.
void drawNestedGrids(QPainter& painter, qreal width, const Colours& colours) {
  painter.fillRect(QRectF(0, 0, width, kHeight), colours.far);
  for (const qreal depth : {0.0, 1.0, 2.0}) {
    QColor colour = colours.near;
    colour.setAlphaF(0.35);
    painter.fillPath(below(width, 45 + 32 * depth, 9 - 2 * depth, 330 + 40 * depth, 0.8 + depth), colour);
  }
  QPainterPath coast(QPointF(0, 0));
  constexpr qreal kStep = 4;
  for (qreal x = 0; x <= width + kStep; x += kStep)
    coast.lineTo(x, 20 + 8 * std::sin(kTau * x / 260) + 4 * std::sin(kTau * x / 71));
  coast.lineTo(width + kStep, 0);
  coast.closeSubpath();
  painter.fillPath(coast, colours.land);
  QColor faint = colours.line;
  faint.setAlphaF(0.35);
  QColor middle = colours.line;
  middle.setAlphaF(0.7);
  const QRectF outer(30, 21, 405, 108);
  const QRectF inner(138, 48, 135, 54);
  const QRectF finest(174, 57, 54, 36);
  drawGrid(painter, outer, 15, 4, faint, 0.9);
  drawGrid(painter, inner, 15, 6, middle, 0.8);
  drawGrid(painter, finest, 18, 12, colours.accent, 0.5);
  painter.setPen(QPen(colours.line, 1.6));
  painter.drawRect(outer);
  painter.drawRect(inner);
  painter.setPen(QPen(colours.accent, 1.8));
  painter.drawRect(finest);
}

// Reeds in shallow water, on one grid.
void drawWetland(QPainter& painter, qreal width, const Colours& colours) {
  painter.fillRect(QRectF(0, 0, width, kHeight), colours.sky);
  painter.fillPath(below(width, 62, 5, 420, 0), colours.land);
  painter.fillPath(below(width, 82, 3, 240, 1), colours.far);
  painter.fillPath(below(width, 112, 2, 150, 2), colours.near);
  // One grid that lies on the water, drawn towards the eye.
  painter.save();
  QPainterPath water = below(width, 82, 3, 240, 1);
  painter.setClipPath(water);
  QColor faint = colours.line;
  faint.setAlphaF(0.4);
  painter.setPen(QPen(faint, 0.8));
  for (qreal y = 86, gap = 5; y < kHeight; y += gap, gap *= 1.25)
    painter.drawLine(QPointF(0, y), QPointF(width, y));
  constexpr qreal kEye = 210;
  for (int i = -40; i <= 60; ++i)
    painter.drawLine(QPointF(kEye + 14.0 * i, 82), QPointF(kEye + 34.0 * i, kHeight));
  painter.restore();
  painter.setBrush(Qt::NoBrush);
  for (int i = 0; 23 * i < width + 40; ++i) {
    if (i % 7 > 3) continue;
    const qreal x = 18 + 23 * i;
    const qreal foot = 112 + 9 * (i % 3);
    const qreal lean = i % 2 == 0 ? 9 : -7;
    const qreal top = foot - 62 - 11 * (i % 4);
    QPainterPath reed(QPointF(x, foot));
    reed.quadTo(x, (foot + top) / 2, x + lean, top);
    reed.moveTo(x + 3, foot);
    reed.quadTo(x + 5, foot - 25, x + 3 - 1.6 * lean, foot - 46);
    QColor stem = colours.line;
    stem.setAlphaF(0.85);
    painter.setPen(QPen(stem, 1.6, Qt::SolidLine, Qt::RoundCap));
    painter.drawPath(reed);
    painter.setPen(QPen(colours.accent, 5, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(QPointF(x + lean, top + 2), QPointF(x + 0.85 * lean, top + 16));
  }
}

}  // namespace

void drawCoverPicture(QPainter& painter, const QRectF& rect, const QString& name, bool dark) {
  painter.save();
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setClipRect(rect);
  painter.translate(rect.topLeft());
  const qreal scale = rect.height() / kHeight;
  painter.scale(scale, scale);
  const qreal width = rect.width() / scale;
  if (name == "wetland") {
    drawWetland(painter, width, coloursOf(dark));
  } else {
    drawNestedGrids(painter, width, coloursOf(dark));
  }
  painter.restore();
}

}  // namespace gridbay::shell
