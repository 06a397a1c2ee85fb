#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "platform/large_memory.h"
#include "platform/result.h"

namespace gridbay {

// A whole file in memory. The bytes are followed by at least `kPadding` zero bytes, so that a scanner may
// read a little beyond the end without a test. The copy is private: a file that another program shortens
// or rewrites afterwards does not change under its reader.
class FileText {
 public:
  static constexpr std::size_t kPadding = 16;

  FileText() : FileText(std::string_view()) {}
  explicit FileText(std::string_view text);
  FileText(LargeBytes bytes, std::size_t size) : bytes_(std::move(bytes)), size_(size) {}

  std::string_view view() const { return {bytes_.get(), size_}; }

 private:
  LargeBytes bytes_;
  std::size_t size_ = 0;
};

// Reads a regular file whole; anything else (a folder, a pipe, a device) is refused.
Result<FileText> readFile(const std::string& path);

}  // namespace gridbay
