// The calls by which files are saved, put in the place of the system's by the linker (--wrap).

#include "tests/support/faults.h"

#include <sys/stat.h>
#include <sys/types.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdio>

namespace gridbay::test {
namespace {

struct Armed {
  bool counting = false;
  int calls = 0;
  int nth = 0;
  Fault fault = Fault::error;
  bool failNext = false;
};
Armed armed;

[[noreturn]] void die() {
  ::kill(::getpid(), SIGKILL);
  ::_exit(99);
}

// Counts a call; true when it is the one that meets the fault.
bool meets() {
  return armed.counting && ++armed.calls == armed.nth;
}

template <class Call>
auto guarded(Call call) -> decltype(call()) {
  if (armed.failNext && armed.counting) {
    armed.failNext = false;
    errno = ENOSPC;
    return -1;
  }
  if (!meets()) return call();
  if (armed.fault == Fault::killBefore) die();
  if (armed.fault == Fault::killAfter) {
    call();
    die();
  }
  errno = ENOSPC;
  return -1;
}

}  // namespace

int withFault(int nth, Fault fault, const std::function<void()>& action) {
  armed = {.counting = true, .nth = nth, .fault = fault};
  action();
  armed.counting = false;
  return armed.calls;
}

bool killedWithFault(int nth, Fault fault, const std::function<void()>& action) {
  const pid_t child = ::fork();
  if (child == 0) {
    withFault(nth, fault, action);
    ::_exit(0);
  }
  int status = 0;
  ::waitpid(child, &status, 0);
  return WIFSIGNALED(status) && WTERMSIG(status) == SIGKILL;
}

}  // namespace gridbay::test

using gridbay::test::armed;
using gridbay::test::Fault;
using gridbay::test::guarded;

extern "C" {

int __real_mkostemp(char* name, int flags);
int __real_fchown(int file, uid_t owner, gid_t group);
int __real_fchmod(int file, mode_t mode);
ssize_t __real_write(int file, const void* bytes, size_t size);
int __real_fsync(int file);
int __real_close(int file);
int __real_rename(const char* from, const char* to);

int __wrap_mkostemp(char* name, int flags) {
  return guarded([&] { return __real_mkostemp(name, flags); });
}
int __wrap_fchown(int file, uid_t owner, gid_t group) {
  return guarded([&] { return __real_fchown(file, owner, group); });
}
int __wrap_fchmod(int file, mode_t mode) {
  return guarded([&] { return __real_fchmod(file, mode); });
}
ssize_t __wrap_write(int file, const void* bytes, size_t size) {
  const bool isShort =
      armed.counting && armed.fault == Fault::shortWrite && armed.calls + 1 == armed.nth && size > 1;
  if (!isShort) return guarded([&] { return __real_write(file, bytes, size); });
  ++armed.calls;
  armed.failNext = true;
  return __real_write(file, bytes, size / 2);
}
int __wrap_fsync(int file) {
  return guarded([&] { return __real_fsync(file); });
}
int __wrap_close(int file) {
  // A descriptor that could not be closed is gone all the same.
  const int closed = guarded([&] { return __real_close(file); });
  const int error = errno;
  if (closed != 0) __real_close(file);
  errno = error;
  return closed;
}
int __wrap_rename(const char* from, const char* to) {
  return guarded([&] { return __real_rename(from, to); });
}
}
