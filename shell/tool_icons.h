#pragma once

#include <QIcon>

namespace gridbay::shell {

enum class Tool { fresh, open, save, undo, redo, validate, start, units, help, advice, differs };

// A tool's picture: that of the desktop's icon theme, and where there is none, or colours of our own are
// chosen, a drawing in the colours of the text. It is drawn anew for each size and colour, so it is always
// crisp.
QIcon toolIcon(Tool tool);

}  // namespace gridbay::shell
