#include "platform/side_by_side.h"

#include <fcntl.h>
#include <poll.h>
#include <sched.h>
#include <sys/mman.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdint>
#include <cstring>
#include <list>
#include <memory>
#include <new>
#include <vector>

#include "platform/files/file_descriptor.h"

namespace gridbay {
namespace {

constexpr int kBetweenLooks = 100;  // milliseconds, at whether to stop
constexpr std::uint64_t kNone = UINT64_MAX;

// What the copies and this process share.
struct Shared {
  std::atomic<std::uint64_t> next{0};
  std::atomic<bool> isStopped{false};
};
static_assert(std::atomic<std::uint64_t>::is_always_lock_free && std::atomic<bool>::is_always_lock_free);

struct Unmap {
  void operator()(Shared* shared) const { ::munmap(shared, sizeof(Shared)); }
};
using SharedHandle = std::unique_ptr<Shared, Unmap>;

SharedHandle makeShared() {
  void* memory = ::mmap(nullptr, sizeof(Shared), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
  return SharedHandle(memory == MAP_FAILED ? nullptr : new (memory) Shared);
}

// Ahead of what came of a piece, and by itself, with no size, when one is begun.
struct Heading {
  std::uint64_t piece = kNone;
  std::uint64_t size = kNone;
};

bool writeAll(int file, const void* bytes, std::size_t size) {
  const char* at = static_cast<const char*>(bytes);
  while (size > 0) {
    const ssize_t n = ::write(file, at, size);
    if (n < 0 && errno == EINTR) continue;
    if (n < 0) return false;
    at += n;
    size -= static_cast<std::size_t>(n);
  }
  return true;
}

[[noreturn]] void workOn(const SideBySide& task, Shared& shared, int results) {
  // A key that stops this process must not stop what a copy is in the middle of.
  ::setpgid(0, 0);
  ::prctl(PR_SET_PDEATHSIG, SIGTERM);
  for (const int signal : {SIGTERM, SIGINT, SIGHUP}) ::signal(signal, SIG_DFL);
  sigset_t none;
  sigemptyset(&none);
  ::sigprocmask(SIG_SETMASK, &none, nullptr);
  try {
    while (!shared.isStopped) {
      const std::uint64_t piece = shared.next++;
      if (piece >= task.count) ::_exit(0);
      const Heading begun{piece, kNone};
      if (!writeAll(results, &begun, sizeof begun)) break;
      const std::string text = task.work(piece);
      const Heading done{piece, text.size()};
      if (!writeAll(results, &done, sizeof done) || !writeAll(results, text.data(), text.size())) break;
    }
  } catch (...) {
  }
  ::_exit(1);
}

// A copy, with what has come from it and not been taken.
class Copy {
 public:
  Copy(pid_t process, FileDescriptor results) : process_(process), results_(std::move(results)) {}
  Copy(const Copy&) = delete;
  Copy& operator=(const Copy&) = delete;
  ~Copy() {
    // What it still writes goes nowhere, so that it doesn't wait for ever.
    ::close(results_.release());
    while (::waitpid(process_, nullptr, 0) < 0 && errno == EINTR) {
    }
  }

  int results() const { return results_.get(); }
  // The piece that it has begun and not handed back.
  std::uint64_t piece() const { return piece_; }

  // Reads what there is; false at the end of the copy.
  bool read(const SideBySide& task) {
    std::array<char, 1 << 16> bytes;
    const ssize_t n = ::read(results(), bytes.data(), bytes.size());
    if (n < 0) return errno == EINTR;
    if (n == 0) return false;
    text_.append(bytes.data(), static_cast<std::size_t>(n));
    std::size_t at = 0;
    while (text_.size() - at >= sizeof(Heading)) {
      Heading heading;
      std::memcpy(&heading, text_.data() + at, sizeof heading);
      if (heading.size == kNone) {
        piece_ = heading.piece;
        at += sizeof heading;
        continue;
      }
      if (text_.size() - at - sizeof heading < heading.size) break;
      piece_ = kNone;
      task.took(heading.piece, text_.substr(at + sizeof heading, heading.size));
      at += sizeof heading + heading.size;
    }
    text_.erase(0, at);
    return true;
  }

 private:
  pid_t process_;
  FileDescriptor results_;
  std::uint64_t piece_ = kNone;
  std::string text_;
};

bool start(const SideBySide& task, Shared& shared, std::list<Copy>& copies) {
  std::array<int, 2> ends{};
  if (::pipe2(ends.data(), O_CLOEXEC) != 0) return false;
  FileDescriptor results(ends[0]);
  const FileDescriptor end(ends[1]);
  const pid_t process = ::fork();
  if (process == 0) {
    // Else it, or another one, would not see that nobody reads what it writes any more.
    ::close(results.release());
    for (const Copy& copy : copies) ::close(copy.results());
    workOn(task, shared, end.get());
  }
  if (process > 0) copies.emplace_back(process, std::move(results));
  return process > 0;
}

}  // namespace

std::size_t coreCount() {
  cpu_set_t cores;
  if (::sched_getaffinity(0, sizeof cores, &cores) != 0) return 1;
  return static_cast<std::size_t>(std::max(CPU_COUNT(&cores), 1));
}

Outcome SideBySide::run() const {
  if (count == 0 || isStopped()) return {};
  const SharedHandle shared = makeShared();
  if (shared == nullptr) return Failure{systemError("cannot start work on", "all cores")};
  // A copy that ends between taking a piece and beginning it leaves no word of it.
  std::vector<bool> isTold(count);
  SideBySide task = *this;
  task.took = [&](std::size_t piece, std::optional<std::string> text) {
    isTold.at(piece) = true;
    took(piece, std::move(text));
  };
  std::list<Copy> copies;
  // Not before the copies have ended does this function, also by an exception of `took`.
  struct Stop {
    Shared& shared;
    ~Stop() { shared.isStopped = true; }
  };
  const Stop atEnd{*shared};
  while (copies.size() < std::clamp<std::size_t>(processes, 1, count)) {
    if (!start(task, *shared, copies)) break;
  }
  if (copies.empty()) return Failure{systemError("cannot start work on", "all cores")};
  std::size_t restarts = 0;
  while (!copies.empty()) {
    if (isStopped()) shared->isStopped = true;
    std::vector<pollfd> waits;
    for (const Copy& copy : copies) waits.push_back({copy.results(), POLLIN, 0});
    if (::poll(waits.data(), waits.size(), kBetweenLooks) <= 0) continue;
    auto copy = copies.begin();
    for (const pollfd& wait : waits) {
      const auto at = copy++;
      if (wait.revents == 0 || at->read(task)) continue;
      const std::uint64_t lost = at->piece();
      copies.erase(at);
      if (lost != kNone) task.took(lost, std::nullopt);
      if (shared->next >= count || shared->isStopped) continue;
      // One for each piece at most, lest copies that come to none are made for ever.
      const bool isStarted = restarts++ < count && start(task, *shared, copies);
      if (!isStarted && copies.empty()) return Failure{systemError("cannot go on with work on", "all cores")};
    }
  }
  for (std::size_t piece = 0; piece < std::min<std::uint64_t>(shared->next, count); ++piece) {
    if (!isTold[piece]) task.took(piece, std::nullopt);
  }
  return {};
}

}  // namespace gridbay
