#include "cli/engine_process.h"

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/mman.h>
#include <sys/signalfd.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <list>

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

// Where a process writes to; -1 for where this one does.
struct Streams {
  int out = -1;
  int err = -1;
};

// Starts the program in a process group of its own, with the signals as they were.
int spawn(const ProcessStart& start, const Streams& streams, const sigset_t& mask, pid_t& child) {
  std::vector<std::string> words{start.program};
  words.insert(words.end(), start.arguments.begin(), start.arguments.end());
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
  posix_spawn_file_actions_t files;
  ::posix_spawn_file_actions_init(&files);
  // Several at once can't read what is typed.
  if (streams.out >= 0) ::posix_spawn_file_actions_addopen(&files, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
  if (streams.out >= 0) ::posix_spawn_file_actions_adddup2(&files, streams.out, STDOUT_FILENO);
  if (streams.err >= 0) ::posix_spawn_file_actions_adddup2(&files, streams.err, STDERR_FILENO);
  const int error = ::posix_spawn(&child, start.program.c_str(), &files, &attributes, argv.data(), environ);
  ::posix_spawn_file_actions_destroy(&files);
  ::posix_spawnattr_destroy(&attributes);
  return error;
}

Result<pid_t> startProcess(const ProcessStart& start, const sigset_t& mask) {
  const FileDescriptor output(
      start.outputFile.empty()
          ? -1
          : ::open(start.outputFile.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666));
  if (!start.outputFile.empty() && !output) return Failure{systemError("cannot write", start.outputFile)};
  pid_t child = 0;
  if (const int error = spawn(start, {output.get(), output.get()}, mask, child); error != 0) {
    errno = error;
    return Failure{systemError("cannot start", start.program)};
  }
  return child;
}

ProcessEnd endOf(int status, bool interrupted) {
  return {WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status), interrupted};
}

}  // namespace

Result<ProcessEnd> runProcess(const ProcessStart& start) {
  Result<ProcessEnd> end = Failure{"Stopped"};
  ProcessQueue{.count = 1,
               .next = [&](std::size_t) { return start; },
               .ended = [&](std::size_t, const Result<ProcessEnd>& what) { end = what; }}
      .run();
  return end;
}

bool ProcessQueue::run() const {
  struct Running {
    pid_t process;
    std::size_t number;
  };
  const sigset_t watched = watchedSignals();
  const BlockedSignals blocked(watched);
  const FileDescriptor signals(::signalfd(-1, &watched, SFD_CLOEXEC));
  std::list<Running> running;
  std::size_t started = 0;
  bool isStopped = false;
  const auto tellAll = [&](int signal) {
    for (const Running& one : running) ::kill(-one.process, signal);
  };
  for (;;) {
    while (!isStopped && started < count && running.size() < std::max<std::size_t>(atOnce, 1)) {
      const std::size_t number = started++;
      const Result<pid_t> child = startProcess(next(number), blocked.before());
      if (!child) {
        ended(number, Failure{child.error()});
        continue;
      }
      running.push_back({*child, number});
      began(number, *child);
    }
    if (running.empty()) return started == count;
    for (auto one = running.begin(); one != running.end();) {
      int status = 0;
      if (::waitpid(one->process, &status, WNOHANG) != one->process) {
        ++one;
        continue;
      }
      if (isStopped) ::kill(-one->process, SIGKILL);
      const std::size_t number = one->number;
      one = running.erase(one);
      ended(number, endOf(status, isStopped));
    }
    if (running.empty() || (!isStopped && started < count && running.size() < atOnce)) continue;
    pollfd wait{signals.get(), POLLIN, 0};
    if (::poll(&wait, 1, isStopped ? kGraceMilliseconds : -1) == 0) {
      tellAll(SIGKILL);
      continue;
    }
    signalfd_siginfo info{};
    if (::read(signals.get(), &info, sizeof info) == sizeof info && info.ssi_signo != SIGCHLD) {
      tellAll(isStopped ? SIGKILL : SIGTERM);
      isStopped = true;
    }
  }
}

Result<std::string> outputOf(const std::string& program, const std::vector<std::string>& arguments) {
  const FileDescriptor errors(::memfd_create("errors", MFD_CLOEXEC));
  int ends[2];
  if (!errors || ::pipe2(ends, O_CLOEXEC) != 0) return Failure{systemError("cannot start", program)};
  const FileDescriptor from(ends[0]);
  FileDescriptor to(ends[1]);
  sigset_t mask;
  ::sigprocmask(SIG_SETMASK, nullptr, &mask);
  pid_t child = 0;
  if (const int error = spawn({program, arguments}, {to.get(), errors.get()}, mask, child); error != 0) {
    errno = error;
    return Failure{systemError("cannot start", program)};
  }
  ::close(to.release());
  const auto readAll = [](int file) {
    std::string text;
    char bytes[4096];
    for (;;) {
      const ssize_t n = ::read(file, bytes, sizeof bytes);
      if (n < 0 && errno == EINTR) continue;
      if (n <= 0) return text;
      text.append(bytes, static_cast<std::size_t>(n));
    }
  };
  std::string out = readAll(from.get());
  int status = 0;
  while (::waitpid(child, &status, 0) < 0 && errno == EINTR) {
  }
  if (WIFEXITED(status) && WEXITSTATUS(status) == 0) return out;
  ::lseek(errors.get(), 0, SEEK_SET);
  std::string why = readAll(errors.get());
  why.erase(why.find_last_not_of('\n') + 1);
  return Failure{why.empty() ? "\"" + program + "\" failed" : why};
}

}  // namespace gridbay::cli
