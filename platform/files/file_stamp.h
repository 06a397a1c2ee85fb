#pragma once

#include <compare>
#include <cstdint>
#include <optional>
#include <string>

namespace gridbay {

// What tells a file from all others, and from itself before a write.
struct FileStamp {
  // Seconds, and nanoseconds beside them.
  struct Moment {
    std::int64_t seconds = 0;
    std::int64_t part = 0;
    auto operator<=>(const Moment&) const = default;
  };

  std::int64_t device = 0;
  std::int64_t number = 0;
  std::int64_t size = 0;
  Moment written;  // its content
  Moment changed;  // its content, owner or names
  auto operator<=>(const FileStamp&) const = default;

  // Whether nobody has written to a file of this name since, or put another one in its place.
  bool isOfSameContent(const FileStamp& other) const {
    return size == other.size && written == other.written;
  }
};

// That of a file as it is now; nothing where there is none.
std::optional<FileStamp> fileStamp(const std::string& path);

}  // namespace gridbay
