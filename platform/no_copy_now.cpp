#include "platform/no_copy_now.h"

#include <pthread.h>

namespace gridbay {
namespace {

// A plain one, which the copy may unlock too.
std::mutex& librariesAtWork() {
  static std::mutex mutex;
  return mutex;
}

}  // namespace

NoCopyNow::NoCopyNow() {
  // For whoever makes the copy, of whatever program part.
  [[maybe_unused]] static const int told =
      ::pthread_atfork([] { librariesAtWork().lock(); }, [] { librariesAtWork().unlock(); },
                       [] { librariesAtWork().unlock(); });
  lock_ = std::unique_lock(librariesAtWork());
}

bool NoCopyNow::isHeld() {
  return !std::unique_lock(librariesAtWork(), std::try_to_lock).owns_lock();
}

}  // namespace gridbay
