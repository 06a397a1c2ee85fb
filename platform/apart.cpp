#include "platform/apart.h"

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <fstream>

#include "platform/files/file_descriptor.h"

namespace gridbay {
namespace {

constexpr char kHolds = 'y';
constexpr unsigned kWaiting = 20;                // times as long as computing
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

[[noreturn]] void makeCheck(const std::function<bool()>& check, unsigned seconds,
                            const FileDescriptor& answer) {
  expectTheWorst(seconds);
  try {
    if (check()) static_cast<void>(::write(answer.get(), &kHolds, 1) == 1);
  } catch (...) {
  }
  ::_exit(0);
}

// An answer, or the end of the copy that gives none.
bool isAnswered(const FileDescriptor& answer) {
  char got = 0;
  while (true) {
    const ssize_t size = ::read(answer.get(), &got, 1);
    if (size >= 0 || errno != EINTR) return size == 1 && got == kHolds;
  }
}

}  // namespace

bool holdsApart(const std::function<bool()>& check, unsigned seconds) {
  std::array<int, 2> ends{};
  if (::pipe2(ends.data(), O_CLOEXEC) != 0) return check();
  FileDescriptor answer(ends[0]);
  FileDescriptor question(ends[1]);
  const pid_t copy = ::fork();
  if (copy == 0) makeCheck(check, seconds, question);
  // A machine that is out of processes still has its data files read.
  if (copy < 0) return check();
  ::close(question.release());
  const bool holds = isAnswered(answer);
  // Its status says nothing more, and where the host ignores its children there is none.
  while (::waitpid(copy, nullptr, 0) < 0 && errno == EINTR) {
  }
  return holds;
}

}  // namespace gridbay
