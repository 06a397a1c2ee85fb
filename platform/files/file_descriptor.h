#pragma once

#include <unistd.h>

#include <string>
#include <string_view>
#include <utility>

namespace gridbay {

// An open file descriptor, closed at the end of its scope.
class FileDescriptor {
 public:
  explicit FileDescriptor(int descriptor) : descriptor_(descriptor) {}
  FileDescriptor(FileDescriptor&& other) noexcept : descriptor_(std::exchange(other.descriptor_, -1)) {}
  FileDescriptor& operator=(FileDescriptor&&) = delete;
  ~FileDescriptor() {
    if (descriptor_ >= 0) ::close(descriptor_);
  }

  explicit operator bool() const { return descriptor_ >= 0; }
  int get() const { return descriptor_; }
  int release() { return std::exchange(descriptor_, -1); }

 private:
  int descriptor_;
};

// "cannot open "setup.v27": No such file or directory", from the system's last error.
std::string systemError(std::string_view what, std::string_view path);

}  // namespace gridbay
