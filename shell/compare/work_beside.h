#pragma once

#include <optional>
#include <string>

#include "shell/background_work.h"

class QWidget;

namespace gridbay::shell {

// Waits for work that has been begun. After a moment a dialog says what is done, in which it can be
// cancelled: false then.
bool waitFor(BackgroundWork& work, const QString& title, QWidget* parent);

// Does work in a copy of the process and waits for it in the same way: nothing where it was cancelled or
// could not be done, which `isCancelled` tells apart.
std::optional<std::string> workBeside(const WorkApart::Work& work, const QString& title, QWidget* parent,
                                      bool& isCancelled);

}  // namespace gridbay::shell
