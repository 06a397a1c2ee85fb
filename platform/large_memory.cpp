#include "platform/large_memory.h"

#include <sys/mman.h>

#include <new>

namespace gridbay {

LargeBytes allocateBytes(std::size_t size) {
  constexpr std::size_t kLargePage = std::size_t{2} << 20;
  if (size < 2 * kLargePage) {
    void* bytes = std::malloc(size == 0 ? 1 : size);
    if (bytes == nullptr) throw std::bad_alloc();
    return LargeBytes(static_cast<char*>(bytes));
  }
  const std::size_t whole = (size + kLargePage - 1) / kLargePage * kLargePage;
  if (whole < size) throw std::bad_alloc();
  void* bytes = std::aligned_alloc(kLargePage, whole);
  if (bytes == nullptr) throw std::bad_alloc();
  // Advice only: without large pages the memory is as good.
  static_cast<void>(::madvise(bytes, whole, MADV_HUGEPAGE));
  return LargeBytes(static_cast<char*>(bytes));
}

}  // namespace gridbay
