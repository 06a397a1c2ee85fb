#include "platform/files/read_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>

#include "platform/files/file_descriptor.h"

namespace gridbay {

FileText::FileText(std::string_view text)
    : bytes_(allocateBytes(text.size() + kPadding)), size_(text.size()) {
  std::copy(text.begin(), text.end(), bytes_.get());
  std::memset(bytes_.get() + text.size(), 0, kPadding);
}

Result<FileText> readFile(const std::string& path) {
  const FileDescriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
  if (!file) return Failure{systemError("cannot open", path)};
  struct stat status {};
  if (::fstat(file.get(), &status) != 0) return Failure{systemError("cannot read", path)};
  if (!S_ISREG(status.st_mode)) return Failure{"cannot read \"" + path + "\": it is not a file"};

  const auto size = static_cast<std::size_t>(status.st_size);
  LargeBytes bytes = allocateBytes(size + FileText::kPadding);
  std::size_t got = 0;
  while (got < size) {
    const ssize_t n = ::read(file.get(), bytes.get() + got, size - got);
    if (n < 0 && errno == EINTR) continue;
    if (n < 0) return Failure{systemError("cannot read", path)};
    if (n == 0) break;
    got += static_cast<std::size_t>(n);
  }
  std::memset(bytes.get() + got, 0, FileText::kPadding);
  return FileText(std::move(bytes), got);
}

}  // namespace gridbay
