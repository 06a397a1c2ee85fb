#include "shell/shades.h"

namespace gridbay::shell {

bool isDark(const QPalette& palette) {
  return palette.color(QPalette::Active, QPalette::Window).lightness() <
         palette.color(QPalette::Active, QPalette::WindowText).lightness();
}

QColor blend(const QColor& from, const QColor& to, double part) {
  const auto mixed = [part](float a, float b) { return static_cast<float>(a + (b - a) * part); };
  return QColor::fromRgbF(mixed(from.redF(), to.redF()), mixed(from.greenF(), to.greenF()),
                          mixed(from.blueF(), to.blueF()));
}

QColor lineColour(const QPalette& palette) {
  return blend(palette.color(QPalette::Active, QPalette::Base),
               palette.color(QPalette::Active, QPalette::Text), isDark(palette) ? 0.26 : 0.22);
}

QColor faultColour(const QPalette& palette) {
  return isDark(palette) ? QColor(0xFF, 0x7B, 0x72) : QColor(0xC6, 0x28, 0x28);
}

QColor quietText(const QPalette& palette) {
  return blend(palette.color(QPalette::Active, QPalette::WindowText),
               palette.color(QPalette::Active, QPalette::Window), 0.35);
}

QColor readOnlyGround(const QPalette& palette) {
  return blend(palette.color(QPalette::Active, QPalette::Base),
               palette.color(QPalette::Active, QPalette::Highlight), isDark(palette) ? 0.14 : 0.07);
}

QColor disabledGround(const QPalette& palette) {
  return blend(palette.color(QPalette::Active, QPalette::Window),
               palette.color(QPalette::Active, QPalette::WindowText), 0.04);
}

QColor headerGround(const QPalette& palette) {
  return blend(palette.color(QPalette::Active, QPalette::Window),
               palette.color(QPalette::Active, QPalette::WindowText), 0.08);
}

}  // namespace gridbay::shell
