#pragma once

#include <functional>

namespace gridbay {

// Whether a check holds. It is made in a copy of this process, where it may crash, go on for ever or ask for
// any memory: then it doesn't hold. What it changes in memory is lost. It has so many seconds of computing,
// and twenty times as long where it waits, as for a slow disk; it must not wait for another thread.
bool holdsApart(const std::function<bool()>& check, unsigned seconds);

}  // namespace gridbay
