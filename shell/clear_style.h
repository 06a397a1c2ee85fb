#pragma once

#include <QProxyStyle>

namespace gridbay::shell {

// The toolkit's own style with edges of fields and buttons that are seen on dark grounds too: it takes them
// from the colour of the window, made darker.
class ClearStyle final : public QProxyStyle {
  Q_OBJECT
 public:
  ClearStyle();

  void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget) const override;
  void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option, QPainter* painter,
                          const QWidget* widget) const override;
  int styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                QStyleHintReturn* data) const override;

 private:
  // The palette to draw edges with. Made once for each, since pictures of controls are kept by palette.
  const QPalette& edged(const QPalette& palette) const;

  mutable qint64 key_ = 0;
  mutable QPalette edged_;
};

}  // namespace gridbay::shell
