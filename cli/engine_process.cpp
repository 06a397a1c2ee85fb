#include "cli/engine_process.h"

#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/signalfd.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>

#include "platform/files/file_descriptor.h"

extern char** environ;

namespace gridbay::cli {
namespace {

constexpr int kGraceMilliseconds = 5000;

sigset_t watchedSignals() {
  sigset_t set;
  sigemptyset(&set);
  for (const int number : {SIGINT, SIGTERM, SIGHUP, SIGCHLD}) sigaddset(&set, number);
  return set;
}

// Blocks the signals for its scope, so that they are read instead of ending this program.
class BlockedSignals {
 public:
  explicit BlockedSignals(const sigset_t& set) { ::sigprocmask(SIG_BLOCK, &set, &before_); }
  BlockedSignals(const BlockedSignals&) = delete;
  BlockedSignals& operator=(const BlockedSignals&) = delete;
  ~BlockedSignals() { ::sigprocmask(SIG_SETMASK, &before_, nullptr); }
  const sigset_t& before() const { return before_; }

 private:
  sigset_t before_{};
};

// Starts the program in a process group of its own, with the signals as they were.
int spawn(const std::string& program, const std::vector<std::string>& arguments, const sigset_t& mask,
          pid_t& child) {
  std::vector<std::string> words{program};
  words.insert(words.end(), arguments.begin(), arguments.end());
  std::vector<char*> argv;
  argv.reserve(words.size() + 1);
  for (std::string& word : words) argv.push_back(word.data());
  argv.push_back(nullptr);
  posix_spawnattr_t attributes;
  ::posix_spawnattr_init(&attributes);
  ::posix_spawnattr_setflags(&attributes,
                             POSIX_SPAWN_SETPGROUP | POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);
  ::posix_spawnattr_setpgroup(&attributes, 0);
  ::posix_spawnattr_setsigmask(&attributes, &mask);
  sigset_t defaults;
  sigemptyset(&defaults);
  for (const int number : {SIGINT, SIGTERM, SIGHUP, SIGPIPE, SIGXFSZ}) sigaddset(&defaults, number);
  ::posix_spawnattr_setsigdefault(&attributes, &defaults);
  const int error = ::posix_spawn(&child, program.c_str(), nullptr, &attributes, argv.data(), environ);
  ::posix_spawnattr_destroy(&attributes);
  return error;
}

}  // namespace

Result<ProcessEnd> runProcess(const std::string& program, const std::vector<std::string>& arguments) {
  const sigset_t watched = watchedSignals();
  const BlockedSignals blocked(watched);
  const FileDescriptor signals(::signalfd(-1, &watched, SFD_CLOEXEC));
  pid_t child = 0;
  if (const int error = spawn(program, arguments, blocked.before(), child); error != 0) {
    errno = error;
    return Failure{systemError("cannot start", program)};
  }
  ProcessEnd end;
  for (;;) {
    int status = 0;
    if (::waitpid(child, &status, WNOHANG) == child) {
      if (end.interrupted) ::kill(-child, SIGKILL);
      end.status = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
      return end;
    }
    pollfd wait{signals.get(), POLLIN, 0};
    if (::poll(&wait, 1, end.interrupted ? kGraceMilliseconds : -1) == 0) {
      ::kill(-child, SIGKILL);
      continue;
    }
    signalfd_siginfo info{};
    if (::read(signals.get(), &info, sizeof info) == sizeof info && info.ssi_signo != SIGCHLD) {
      ::kill(-child, end.interrupted ? SIGKILL : SIGTERM);
      end.interrupted = true;
    }
  }
}

}  // namespace gridbay::cli
