#include "platform/work_apart.h"

#include <poll.h>
#include <sys/socket.h>
#include <sys/wait.h>

#include <array>
#include <cerrno>
#include <chrono>
#include <cmath>
#include <csignal>
#include <cstdint>
#include <cstring>
#include <thread>
#include <utility>

#include "platform/apart.h"
#include "platform/files/unfinished_file.h"

namespace gridbay {
namespace {

// Ahead of a text, or by itself with how much is done.
struct Heading {
  double done = 0;
  std::uint64_t size = UINT64_MAX;

  bool isOfText() const { return size != UINT64_MAX; }
};

bool sendAll(int line, const void* bytes, std::size_t size) {
  const char* at = static_cast<const char*>(bytes);
  while (size > 0) {
    const ssize_t n = ::send(line, at, size, MSG_NOSIGNAL);
    if (n < 0 && errno == EINTR) continue;
    if (n < 0) return false;
    at += n;
    size -= static_cast<std::size_t>(n);
  }
  return true;
}

// The other process never says anything: there is nothing to read until it doesn't want to hear any more.
bool isWanted(int line) {
  char none = 0;
  return ::recv(line, &none, 1, MSG_DONTWAIT) < 0 && (errno == EAGAIN || errno == EINTR);
}

[[noreturn]] void workFor(const WorkApart::Work& work, int line) {
  constexpr std::size_t kMostMemory = std::size_t{8} << 30;
  expectTheWorst(kMostMemory);
  try {
    constexpr double kWorthTelling = 0.002;
    double told = 0;
    const std::string text = work([&](double done) {
      if (!isWanted(line)) return false;
      if (std::abs(done - told) < kWorthTelling && done < 1) return true;
      told = done;
      const Heading heading{done};
      return sendAll(line, &heading, sizeof heading);
    });
    const Heading heading{1, text.size()};
    if (sendAll(line, &heading, sizeof heading)) sendAll(line, text.data(), text.size());
  } catch (...) {
  }
  ::_exit(0);
}

}  // namespace

Result<WorkApart> WorkApart::begin(const Work& work, std::string file) {
  std::array<int, 2> ends{};
  if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0)
    return Failure{systemError("cannot start", "work beside this")};
  FileDescriptor here(ends[0]);
  const FileDescriptor there(ends[1]);
  const pid_t process = ::fork();
  if (process < 0) return Failure{systemError("cannot start", "work beside this")};
  if (process == 0) {
    ::close(here.release());
    workFor(work, there.get());
  }
  return WorkApart(std::move(here), process, std::move(file));
}

WorkApart::WorkApart(WorkApart&& other) noexcept
    : line_(std::move(other.line_)),
      process_(std::exchange(other.process_, -1)),
      file_(std::move(other.file_)),
      read_(std::move(other.read_)),
      done_(other.done_),
      text_(std::move(other.text_)) {}

WorkApart::~WorkApart() {
  if (process_ < 0) return;
  stop();
  if (file_.empty()) ::kill(process_, SIGKILL);
  using namespace std::chrono_literals;
  const auto end = std::chrono::steady_clock::now() + 2s;
  while (::waitpid(process_, nullptr, WNOHANG) == 0) {
    if (std::chrono::steady_clock::now() > end) ::kill(process_, SIGKILL);
    std::this_thread::sleep_for(2ms);
  }
  if (!file_.empty()) removeUnfinished(file_, process_);
}

void WorkApart::stop() {
  ::shutdown(line_.get(), SHUT_RDWR);
}

bool WorkApart::take() {
  std::array<char, 1 << 16> bytes;
  while (true) {
    const ssize_t n = ::recv(line_.get(), bytes.data(), bytes.size(), MSG_DONTWAIT);
    if (n < 0 && errno == EINTR) continue;
    const bool isAtEnd = n == 0 || (n < 0 && errno != EAGAIN);
    if (n > 0) read_.append(bytes.data(), static_cast<std::size_t>(n));
    std::size_t at = 0;
    while (read_.size() - at >= sizeof(Heading)) {
      Heading heading;
      std::memcpy(&heading, read_.data() + at, sizeof heading);
      if (heading.isOfText()) {
        if (read_.size() - at - sizeof heading < heading.size) break;
        text_ = read_.substr(at + sizeof heading, heading.size);
        return false;
      }
      done_ = heading.done;
      at += sizeof heading;
    }
    read_.erase(0, at);
    if (n <= 0) return !isAtEnd;
  }
}

}  // namespace gridbay
