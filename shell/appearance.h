#pragma once

#include <QMenu>

namespace gridbay::shell {

enum class Appearance { desktop, light, dark };

// Colours of all windows: those of the desktop, or light or dark ones of our own.
void setAppearance(Appearance appearance);
// The menu that offers them, with the choice kept for the next start.
QMenu* makeAppearanceMenu(QWidget* parent);

}  // namespace gridbay::shell
