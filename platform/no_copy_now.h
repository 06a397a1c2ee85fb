#pragma once

#include <mutex>

namespace gridbay {

// While a thread has one, no other one makes a copy of the process: what a library has locked by then would
// stay locked in the copy for ever. For the work of libraries in threads of their own; a copy waits for it.
class NoCopyNow {
 public:
  NoCopyNow();

  // Whether one is held now, for who would rather come back later than wait.
  static bool isHeld();

 private:
  std::unique_lock<std::mutex> lock_;
};

}  // namespace gridbay
