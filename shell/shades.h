#pragma once

#include <QPalette>

namespace gridbay::shell {

// Colours made of those of a palette, so that they fit light and dark alike.
bool isDark(const QPalette& palette);
// A part (0 to 1) of the way from one colour to another.
QColor blend(const QColor& from, const QColor& to, double part);
// Lines of tables and edges of frames.
QColor lineColour(const QPalette& palette);
// What is wrong, as text and as the edge of a field.
QColor faultColour(const QPalette& palette);
// A text that stands back, such as a unit behind its number.
QColor quietText(const QPalette& palette);
// The ground of what can be read and not typed, and of what does not apply at present.
QColor readOnlyGround(const QPalette& palette);
QColor disabledGround(const QPalette& palette);
QColor headerGround(const QPalette& palette);

}  // namespace gridbay::shell
