#include "platform/apart.h"

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <fstream>

namespace gridbay {
namespace {

constexpr unsigned kWaiting = 20;
constexpr rlim_t kMostMemory = rlim_t{2} << 30;  // beyond what the process has

// So that whatever happens to the copy ends it at once, and leaves neither a word nor a file.
void expectTheWorst(unsigned seconds) {
  for (const int signal : {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT, SIGALRM, SIGTERM, SIGINT})
    ::signal(signal, SIG_DFL);
  sigset_t none;
  sigemptyset(&none);
  ::sigprocmask(SIG_SETMASK, &none, nullptr);
  ::prctl(PR_SET_DUMPABLE, 0);
  ::alarm(kWaiting * seconds);
  const rlimit computing{seconds, seconds};
  ::setrlimit(RLIMIT_CPU, &computing);
  const int nowhere = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
  ::dup2(nowhere, STDOUT_FILENO);
  ::dup2(nowhere, STDERR_FILENO);
  rlim_t pages = 0;
  if (std::ifstream("/proc/self/statm") >> pages) {
    const rlim_t most = pages * static_cast<rlim_t>(::sysconf(_SC_PAGESIZE)) + kMostMemory;
    const rlimit limit{most, most};
    ::setrlimit(RLIMIT_AS, &limit);
  }
}

[[noreturn]] void makeCheck(const std::function<bool()>& check, unsigned seconds) {
  bool holds = false;
  expectTheWorst(seconds);
  try {
    holds = check();
  } catch (...) {
  }
  ::_exit(holds ? 0 : 1);
}

}  // namespace

bool holdsApart(const std::function<bool()>& check, unsigned seconds) {
  const pid_t copy = ::fork();
  if (copy == 0) makeCheck(check, seconds);
  // A machine that is out of processes still has its data files read.
  if (copy < 0) return check();
  int status = 0;
  while (::waitpid(copy, &status, 0) < 0) {
    if (errno != EINTR) return false;
  }
  return WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

}  // namespace gridbay
