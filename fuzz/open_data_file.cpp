// The data file opener: any bytes are a data file that can be read, or are refused with a reason.

#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "platform/tsb/tsb_file.h"

using namespace gridbay;

namespace {

// A file in memory that each input is put in.
class Place {
 public:
  Place() {
    if (::mkdtemp(folder_.data()) == nullptr) std::abort();
    path_ = folder_ + "/input.tsb2";
  }
  Place(const Place&) = delete;
  Place& operator=(const Place&) = delete;
  ~Place() { std::filesystem::remove_all(folder_); }

  const std::string& put(const unsigned char* data, std::size_t size) const {
    std::ofstream file(path_, std::ios::binary | std::ios::trunc);
    file.write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    file.close();
    if (!file) std::abort();
    return path_;
  }

 private:
  std::string folder_ = "/dev/shm/gridbay-fuzz-XXXXXX";
  std::string path_;
};

// What can be said of a run at its end: files that all are refused would say nothing of a reader.
struct Tally {
  long opened = 0;
  long refused = 0;
  ~Tally() { std::fprintf(stderr, "%ld files opened, %ld refused\n", opened, refused); }
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  static const Place place;
  static Tally tally;
  const Result<TsbFile> file = TsbFile::open(place.put(data, size));
  ++(file ? tally.opened : tally.refused);
  if (!file) {
    if (file.error().empty()) std::abort();
    return 0;
  }
  if (file->definition().pointCount() > (1U << 20)) return 0;
  std::vector<float> values(file->definition().pointCount());
  for (std::size_t item = 1; item <= file->definition().items.size() && item <= 3; ++item) {
    const Outcome read = file->read(item, 0, std::span<float>(values));
    if (!read && read.error().empty()) std::abort();
    const std::size_t steps = file->definition().time.count;
    const Outcome last = file->readSteps(item, steps - 1, values);
    if (!last && last.error().empty()) std::abort();
  }
  return 0;
}
