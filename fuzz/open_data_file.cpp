// The data file opener: any bytes are a data file that can be read, or are refused with a reason.

#include <pthread.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <optional>
#include <string>
#include <vector>

#include "fuzz/data_file_mutator.h"
#include "platform/tsb/tsb_file.h"

using namespace gridbay;

namespace {

// A file in memory that each input is put in.
class Place {
 public:
  Place(const Place&) = delete;
  Place& operator=(const Place&) = delete;
  ~Place() { std::filesystem::remove_all(folder_); }

  const std::string& put(const unsigned char* data, std::size_t size) const {
    std::filesystem::remove(path_);
    std::ofstream file(path_, std::ios::binary);
    file.write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    file.close();
    if (!file) std::abort();
    return path_;
  }
  // Null when it is larger than that.
  std::optional<std::size_t> take(unsigned char* data, std::size_t most) const {
    const std::size_t size = std::filesystem::file_size(path_);
    std::ifstream file(path_, std::ios::binary);
    if (size > most || !file.read(reinterpret_cast<char*>(data), static_cast<std::streamsize>(size)))
      return std::nullopt;
    return size;
  }

  static const Place& only() {
    static const Place place;
    return place;
  }

 private:
  Place() {
    if (::mkdtemp(folder_.data()) == nullptr) std::abort();
    path_ = folder_ + "/input.tsb2";
  }

  std::string folder_ = "/dev/shm/gridbay-fuzz-XXXXXX";
  std::string path_;
};

// A copy of the process that looks at a file apart may end in any way, which is no finding.
extern "C" void __sanitizer_set_death_callback(void (*callback)());
const int kForgetsFindings =
    ::pthread_atfork(nullptr, nullptr, [] { __sanitizer_set_death_callback(nullptr); });

// What can be said of a run at its end: files that all are refused would say nothing of a reader.
struct Tally {
  long opened = 0;
  long refused = 0;
  ~Tally() { std::fprintf(stderr, "%ld files opened, %ld refused\n", opened, refused); }
};

}  // namespace

extern "C" std::size_t LLVMFuzzerMutate(unsigned char* data, std::size_t size, std::size_t most);

// One time in four the bytes are changed, else what they say.
extern "C" std::size_t LLVMFuzzerCustomMutator(unsigned char* data, std::size_t size, std::size_t most,
                                               unsigned seed) {
  if (seed % 4 != 0 && mutateDataFile(Place::only().put(data, size), seed)) {
    if (const auto taken = Place::only().take(data, most)) return *taken;
  }
  return LLVMFuzzerMutate(data, size, most);
}

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  static Tally tally;
  const Result<TsbFile> file = TsbFile::open(Place::only().put(data, size));
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
