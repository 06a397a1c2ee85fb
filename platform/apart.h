#pragma once

#include <cstddef>
#include <functional>
#include <vector>

namespace gridbay {

// Which of so many checks (from 0) hold. They are made one after the other in a copy of this process, where
// one may crash, go on for ever or ask for any memory: then it doesn't hold, and neither do those after it,
// which are not made. What they change in memory is lost. Each has so many seconds of computing, and twenty
// times as long where it waits, as for a slow disk; it must not wait for another thread.
std::vector<bool> holdApart(std::size_t count, const std::function<bool(std::size_t)>& check,
                            unsigned seconds);

// The same for one check.
bool holdsApart(const std::function<bool()>& check, unsigned seconds);

// For a copy of this process that reads what may harm: whatever happens ends it at once, and it leaves
// neither a word nor a file. It may take so many bytes beyond what the process has.
void expectTheWorst(std::size_t mostMemory);

}  // namespace gridbay
