#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "platform/files/file_descriptor.h"
#include "platform/large_memory.h"
#include "platform/result.h"

namespace gridbay {

// Reads a text file line by line, with no more than a piece of it in memory.
class LineReader {
 public:
  // Of a longer line only so many bytes are seen.
  static constexpr std::size_t kLongestLine = std::size_t{1} << 20;
  // Is told how much of the file has been read, 0 to 1, each time that a piece has; false ends the reading.
  using Progress = std::function<bool(double done)>;

  // A regular file; anything else (a folder, a pipe, a device) is refused.
  static Result<LineReader> open(const std::string& path, Progress progress = {});

  // The next line with no line feed at its end, until the next call; nothing at the end, or where the reading
  // has ended before.
  std::optional<std::string_view> next();
  // Of the last line: whether there is more of it than was seen.
  bool isCut() const { return isCut_; }
  // Why there are no more lines, other than that the file is at its end.
  bool hasFailed() const { return state_ == State::failed; }
  bool isStopped() const { return state_ == State::stopped; }

 private:
  enum class State { reading, ended, failed, stopped };

  LineReader(FileDescriptor file, std::uint64_t size, Progress progress);
  bool refill();
  bool skipLine();

  FileDescriptor file_;
  std::uint64_t size_;
  Progress progress_;
  LargeBytes bytes_;
  std::size_t at_ = 0;   // the first byte that no line has had
  std::size_t end_ = 0;  // of what is in memory
  std::uint64_t read_ = 0;
  State state_ = State::reading;
  bool isCut_ = false;
};

}  // namespace gridbay
