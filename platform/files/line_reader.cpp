#include "platform/files/line_reader.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <cstring>

namespace gridbay {

Result<LineReader> LineReader::open(const std::string& path, Progress progress) {
  FileDescriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
  if (!file) return Failure{systemError("cannot open", path)};
  struct stat status {};
  if (::fstat(file.get(), &status) != 0) return Failure{systemError("cannot read", path)};
  if (!S_ISREG(status.st_mode)) return Failure{"cannot read \"" + path + "\": it is not a file"};
  return LineReader(std::move(file), static_cast<std::uint64_t>(status.st_size), std::move(progress));
}

LineReader::LineReader(FileDescriptor file, std::uint64_t size, Progress progress)
    : file_(std::move(file)),
      size_(size),
      progress_(std::move(progress)),
      bytes_(allocateBytes(kLongestLine)) {}

// Reads behind what is left, which moves to the front; false when there is nothing more.
bool LineReader::refill() {
  if (state_ != State::reading) return false;
  if (at_ > 0) {
    std::memmove(bytes_.get(), bytes_.get() + at_, end_ - at_);
    end_ -= at_;
    at_ = 0;
  }
  ssize_t got = 0;
  do {
    got = ::read(file_.get(), bytes_.get() + end_, kLongestLine - end_);
  } while (got < 0 && errno == EINTR);
  if (got <= 0) {
    state_ = got == 0 ? State::ended : State::failed;
    return false;
  }
  end_ += static_cast<std::size_t>(got);
  read_ += static_cast<std::uint64_t>(got);
  const double done = static_cast<double>(read_) / static_cast<double>(std::max(size_, read_));
  if (progress_ && !progress_(done)) state_ = State::stopped;
  return state_ == State::reading;
}

// Passes over the rest of a line that was cut; false when the reading ends in it.
bool LineReader::skipLine() {
  isCut_ = false;
  while (true) {
    const void* feed = std::memchr(bytes_.get() + at_, '\n', end_ - at_);
    if (feed != nullptr) {
      at_ = static_cast<std::size_t>(static_cast<const char*>(feed) - bytes_.get()) + 1;
      return true;
    }
    at_ = end_;
    if (!refill()) return false;
  }
}

std::optional<std::string_view> LineReader::next() {
  if (isStopped() || (isCut_ && !skipLine())) return std::nullopt;
  std::size_t searched = at_;
  while (true) {
    const char* feed = static_cast<const char*>(std::memchr(bytes_.get() + searched, '\n', end_ - searched));
    if (feed != nullptr) {
      const std::string_view line(bytes_.get() + at_, static_cast<std::size_t>(feed - bytes_.get()) - at_);
      at_ += line.size() + 1;
      return line;
    }
    const std::size_t seen = end_ - at_;
    isCut_ = seen == kLongestLine;
    if (isCut_ || !refill()) break;
    searched = at_ + seen;
  }
  const std::string_view line(bytes_.get() + at_, end_ - at_);
  at_ = end_;
  if (!isCut_ && (state_ != State::ended || line.empty())) return std::nullopt;
  return line;
}

}  // namespace gridbay
