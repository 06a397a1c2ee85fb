#include "platform/apart.h"

#include <fcntl.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <ctime>
#include <fstream>
#include <optional>

#include "platform/files/file_descriptor.h"

namespace gridbay {
namespace {

constexpr char kHolds = 'y';
constexpr char kDoesNotHold = 'n';
constexpr unsigned kWaiting = 20;                          // times as long as computing
constexpr std::size_t kMostMemory = std::size_t{2} << 30;  // beyond what the process has

// From now on; the limit is in whole seconds.
void allowSeconds(unsigned seconds) {
  ::alarm(kWaiting * seconds);
  timespec used{};
  ::clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &used);
  rlimit computing{};
  ::getrlimit(RLIMIT_CPU, &computing);
  computing.rlim_cur = std::min(computing.rlim_max, static_cast<rlim_t>(used.tv_sec) + 1 + seconds);
  ::setrlimit(RLIMIT_CPU, &computing);
}

[[noreturn]] void makeChecks(std::size_t count, const std::function<bool(std::size_t)>& check,
                             unsigned seconds, const FileDescriptor& answers) {
  expectTheWorst(kMostMemory);
  try {
    for (std::size_t i = 0; i < count; ++i) {
      allowSeconds(seconds);
      const char answer = check(i) ? kHolds : kDoesNotHold;
      if (::write(answers.get(), &answer, 1) != 1) break;
    }
  } catch (...) {
  }
  ::_exit(0);
}

// The next answer, or the end of the copy that gives none.
std::optional<bool> nextOf(const FileDescriptor& answers) {
  char got = 0;
  while (true) {
    const ssize_t size = ::read(answers.get(), &got, 1);
    if (size == 1) return got == kHolds;
    if (size == 0 || errno != EINTR) return std::nullopt;
  }
}

std::vector<bool> makeHere(std::size_t count, const std::function<bool(std::size_t)>& check) {
  std::vector<bool> holds(count);
  for (std::size_t i = 0; i < count; ++i) holds[i] = check(i);
  return holds;
}

}  // namespace

void expectTheWorst(std::size_t mostMemory) {
  for (const int signal :
       {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT, SIGALRM, SIGXCPU, SIGTERM, SIGINT, SIGHUP})
    ::signal(signal, SIG_DFL);
  sigset_t none;
  sigemptyset(&none);
  ::sigprocmask(SIG_SETMASK, &none, nullptr);
  ::prctl(PR_SET_DUMPABLE, 0);
  const int nowhere = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
  ::dup2(nowhere, STDOUT_FILENO);
  ::dup2(nowhere, STDERR_FILENO);
  rlim_t pages = 0;
  if (std::ifstream("/proc/self/statm") >> pages) {
    const rlim_t most = pages * static_cast<rlim_t>(::sysconf(_SC_PAGESIZE)) + mostMemory;
    const rlimit limit{most, most};
    ::setrlimit(RLIMIT_AS, &limit);
  }
}

std::vector<bool> holdApart(std::size_t count, const std::function<bool(std::size_t)>& check,
                            unsigned seconds) {
  if (count == 0) return {};
  std::array<int, 2> ends{};
  if (::pipe2(ends.data(), O_CLOEXEC) != 0) return makeHere(count, check);
  FileDescriptor answers(ends[0]);
  FileDescriptor question(ends[1]);
  const pid_t copy = ::fork();
  if (copy == 0) makeChecks(count, check, seconds, question);
  // A machine that is out of processes still has its data files read.
  if (copy < 0) return makeHere(count, check);
  ::close(question.release());
  std::vector<bool> holds(count);
  for (std::size_t i = 0; i < count; ++i) {
    const std::optional<bool> answer = nextOf(answers);
    if (!answer) break;
    holds[i] = *answer;
  }
  // Its status says nothing more, and where the host ignores its children there is none.
  while (::waitpid(copy, nullptr, 0) < 0 && errno == EINTR) {
  }
  return holds;
}

bool holdsApart(const std::function<bool()>& check, unsigned seconds) {
  return holdApart(
      1, [&check](std::size_t) { return check(); }, seconds)[0];
}

}  // namespace gridbay
