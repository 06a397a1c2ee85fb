#include "shell/tool_icons.h"

#include <QGuiApplication>
#include <QIconEngine>
#include <QPainter>
#include <QPainterPath>
#include <QPalette>

namespace gridbay::shell {
namespace {

constexpr qreal kGrid = 24;  // the drawings' own units in each direction

// A drawing: strokes in the colour of the text, and one shape that stands out.
struct Drawing {
  QPainterPath strokes;
  QPainterPath accent;
  bool fillsAccent = false;
};

QPainterPath lines(std::initializer_list<QPointF> points, bool closed = false) {
  QPainterPath path;
  for (const QPointF& point : points) {
    if (path.elementCount() == 0) {
      path.moveTo(point);
    } else {
      path.lineTo(point);
    }
  }
  if (closed) path.closeSubpath();
  return path;
}

Drawing page() {
  Drawing drawing{lines({{13.5, 3}, {5.5, 3}, {5.5, 21}, {18.5, 21}, {18.5, 8}, {13.5, 3}}, true), {}};
  drawing.strokes.addPath(lines({{13.5, 3}, {13.5, 8}, {18.5, 8}}));
  return drawing;
}

Drawing fresh() {
  Drawing drawing = page();
  drawing.accent = lines({{12, 11}, {12, 18}});
  drawing.accent.addPath(lines({{8.5, 14.5}, {15.5, 14.5}}));
  return drawing;
}

Drawing validate() {
  Drawing drawing = page();
  drawing.accent = lines({{8.5, 14.5}, {11.2, 17.2}, {15.5, 11.5}});
  return drawing;
}

Drawing open() {
  Drawing drawing{lines({{3, 19.5}, {3, 5}, {9, 5}, {11.5, 7.5}, {19, 7.5}, {19, 11}}), {}};
  drawing.strokes.addPath(lines({{3, 19.5}, {6.5, 11}, {22, 11}, {18.5, 19.5}}, true));
  return drawing;
}

Drawing save() {
  Drawing drawing{lines({{4, 15}, {4, 20.5}, {20, 20.5}, {20, 15}}), {}};
  drawing.accent = lines({{12, 3}, {12, 15}});
  drawing.accent.addPath(lines({{7.5, 10.5}, {12, 15}, {16.5, 10.5}}));
  return drawing;
}

Drawing undo() {
  Drawing drawing{lines({{8.5, 4.5}, {4, 9}, {8.5, 13.5}}), {}};
  drawing.strokes.moveTo(4, 9);
  drawing.strokes.lineTo(14.5, 9);
  drawing.strokes.arcTo(QRectF(9.25, 9, 10.5, 10.5), 90, -180);
  drawing.strokes.lineTo(9, 19.5);
  return drawing;
}

Drawing redo() {
  Drawing drawing = undo();
  drawing.strokes = QTransform(-1, 0, 0, 1, kGrid, 0).map(drawing.strokes);
  return drawing;
}

Drawing start() {
  return {{}, lines({{7, 4.5}, {19.5, 12}, {7, 19.5}}, true), true};
}

Drawing units() {
  Drawing drawing;
  drawing.strokes.addRoundedRect(QRectF(2.5, 7.5, 19, 9), 1.5, 1.5);
  constexpr qreal kFirst = 6;
  for (int i = 0; i < 5; ++i) {
    const qreal x = kFirst + 3 * i;
    drawing.strokes.addPath(lines({{x, 7.5}, {x, i % 2 == 0 ? 12.5 : 10.5}}));
  }
  return drawing;
}

Drawing help() {
  Drawing drawing;
  drawing.strokes.addEllipse(QPointF(12, 12), 9, 9);
  drawing.accent.moveTo(9, 9.8);
  drawing.accent.cubicTo(9, 5.8, 15, 5.8, 15, 9.8);
  drawing.accent.cubicTo(15, 12, 12, 11.8, 12, 14.2);
  drawing.accent.addEllipse(QPointF(12, 17.2), 0.3, 0.3);
  return drawing;
}

// A lamp.
Drawing advice() {
  Drawing drawing{lines({{9.5, 18.5}, {14.5, 18.5}}), {}};
  drawing.strokes.addPath(lines({{10.5, 21.5}, {13.5, 21.5}}));
  drawing.accent.moveTo(9.5, 15.5);
  drawing.accent.cubicTo(9.5, 13, 5.5, 12, 5.5, 8.5);
  drawing.accent.cubicTo(5.5, 0.5, 18.5, 0.5, 18.5, 8.5);
  drawing.accent.cubicTo(18.5, 12, 14.5, 13, 14.5, 15.5);
  drawing.accent.closeSubpath();
  return drawing;
}

Drawing differs() {
  Drawing drawing;
  drawing.accent.addEllipse(QPointF(12, 12), 4.5, 4.5);
  drawing.fillsAccent = true;
  return drawing;
}

struct Entry {
  const char* themeName;
  Drawing (*draw)();
};

// In the order of the tools.
constexpr Entry kEntries[] = {
    {"document-new", fresh},
    {"document-open", open},
    {"document-save", save},
    {"edit-undo", undo},
    {"edit-redo", redo},
    {"tools-check-spelling", validate},
    {"media-playback-start", start},
    {"measure", units},
    {"help-contents", help},
    {"dialog-information", advice},
    {"", differs},
};

class Engine final : public QIconEngine {
 public:
  explicit Engine(Tool tool) : tool_(tool) {}

  void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State state) override {
    const Entry& entry = kEntries[static_cast<std::size_t>(tool_)];
    // A theme goes with the desktop's colours, and may not be seen on others.
    const bool isDesktop = !QCoreApplication::testAttribute(Qt::AA_SetPalette);
    if (isDesktop && QIcon::hasThemeIcon(entry.themeName)) {
      QIcon::fromTheme(entry.themeName).paint(painter, rect, Qt::AlignCenter, mode, state);
      return;
    }
    const QPalette palette = QGuiApplication::palette();
    const auto group = mode == QIcon::Disabled ? QPalette::Disabled : QPalette::Active;
    const QColor text = palette.color(group, QPalette::ButtonText);
    const QColor accent = mode == QIcon::Disabled   ? text
                          : mode == QIcon::Selected ? palette.color(group, QPalette::HighlightedText)
                                                    : palette.color(group, QPalette::Link);
    const Drawing drawing = entry.draw();
    constexpr qreal kWidth = 1.6;
    painter->save();
    painter->setRenderHint(QPainter::Antialiasing);
    painter->translate(rect.topLeft());
    painter->scale(rect.width() / kGrid, rect.height() / kGrid);
    painter->strokePath(drawing.strokes, QPen(text, kWidth, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter->setBrush(drawing.fillsAccent ? QBrush(accent) : QBrush(Qt::NoBrush));
    painter->setPen(QPen(accent, kWidth, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter->drawPath(drawing.accent);
    painter->restore();
  }

  QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override {
    QPixmap drawn(size);
    drawn.fill(Qt::transparent);
    QPainter painter(&drawn);
    paint(&painter, QRect(QPoint(), size), mode, state);
    return drawn;
  }

  QIconEngine* clone() const override { return std::make_unique<Engine>(tool_).release(); }
  bool isNull() override { return false; }

 private:
  Tool tool_;
};

}  // namespace

QIcon toolIcon(Tool tool) {
  return QIcon(std::make_unique<Engine>(tool).release());  // the icon owns it
}

}  // namespace gridbay::shell
