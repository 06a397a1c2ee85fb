#pragma once

#include <functional>

namespace gridbay::test {

// What happens at one of the system calls by which a file is saved.
enum class Fault {
  error,       // it fails as on a full disk, having done nothing
  shortWrite,  // a write does half of its work, and the next one fails
  killBefore,  // the process is killed before it
  killAfter,   // the process is killed after it
};

// Runs an action while the `nth` (from 1) of the calls open, fchown, fchmod, write, fsync, close and rename
// meets a fault; 0 for none. Returns how many calls there were. Only calls of the code under test are
// counted.
int withFault(int nth, Fault fault, const std::function<void()>& action);

// The same in a process of its own, which the fault may kill; true when it was killed.
bool killedWithFault(int nth, Fault fault, const std::function<void()>& action);

}  // namespace gridbay::test
