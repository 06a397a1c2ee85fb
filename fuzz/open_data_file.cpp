// The data file opener: any bytes are a data file that can be read, or are refused with a reason.

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

#include <cstdlib>
#include <string>
#include <vector>

#include "platform/tsb/tsb_file.h"

using namespace gridbay;

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  static const int memory = ::memfd_create("fuzz", 0);
  static const std::string path = "/proc/self/fd/" + std::to_string(memory);
  if (::ftruncate(memory, 0) != 0 || ::pwrite(memory, data, size, 0) != static_cast<ssize_t>(size))
    std::abort();
  const Result<TsbFile> file = TsbFile::open(path);
  if (!file) {
    if (file.error().empty()) std::abort();
    return 0;
  }
  if (file->definition().pointCount() > (1U << 20)) return 0;
  std::vector<float> values(file->definition().pointCount());
  for (std::size_t item = 1; item <= file->definition().items.size() && item <= 3; ++item) {
    const Outcome read = file->read(item, 0, std::span<float>(values));
    if (!read && read.error().empty()) std::abort();
  }
  return 0;
}
