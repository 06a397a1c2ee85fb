#include "shell/clear_style.h"

#include <QStyleOption>

#include "shell/shades.h"

namespace gridbay::shell {
namespace {

// Draws with another palette. The options of each kind of control are of a type of their own, and there is no
// copying one that is not known.
template <class Draw>
void drawnWith(const QPalette& palette, const QStyleOption* option, const Draw& draw) {
  auto* changed = const_cast<QStyleOption*>(option);
  const QPalette kept = std::exchange(changed->palette, palette);
  changed->palette.setCurrentColorGroup(kept.currentColorGroup());
  draw();
  changed->palette = kept;
}

}  // namespace

ClearStyle::ClearStyle() : QProxyStyle("Fusion") {}

const QPalette& ClearStyle::edged(const QPalette& palette) const {
  if (key_ == palette.cacheKey()) return edged_;
  key_ = palette.cacheKey();
  edged_ = palette;
  for (const auto group : {QPalette::Active, QPalette::Inactive, QPalette::Disabled}) {
    const QColor window = palette.color(group, QPalette::Window);
    edged_.setColor(group, QPalette::Window,
                    blend(window, palette.color(QPalette::Active, QPalette::WindowText),
                          group == QPalette::Disabled ? 0.25 : 0.5));
  }
  return edged_;
}

void ClearStyle::drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                               const QWidget* widget) const {
  const bool hasEdge = element == PE_FrameLineEdit || element == PE_Frame ||
                       element == PE_IndicatorCheckBox || element == PE_IndicatorRadioButton ||
                       element == PE_PanelButtonCommand;
  const auto draw = [&] { QProxyStyle::drawPrimitive(element, option, painter, widget); };
  if (!hasEdge || !isDark(option->palette)) return draw();
  drawnWith(edged(option->palette), option, draw);
}

void ClearStyle::drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                                    QPainter* painter, const QWidget* widget) const {
  const auto draw = [&] { QProxyStyle::drawComplexControl(control, option, painter, widget); };
  if ((control != CC_ComboBox && control != CC_SpinBox) || !isDark(option->palette)) return draw();
  drawnWith(edged(option->palette), option, draw);
}

int ClearStyle::styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                          QStyleHintReturn* data) const {
  // A list opens below its field, as long as it needs.
  if (hint == SH_ComboBox_Popup) return 0;
  return QProxyStyle::styleHint(hint, option, widget, data);
}

}  // namespace gridbay::shell
