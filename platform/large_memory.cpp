#include "platform/large_memory.h"

#include <sys/mman.h>

#include <cstdint>
#include <cstdlib>
#include <new>

namespace gridbay {

void FreeBytes::operator()(char* bytes) const {
  if (mapped == 0) {
    std::free(bytes);
  } else {
    ::munmap(bytes, mapped);
  }
}

LargeBytes allocateBytes(std::size_t size) {
  constexpr std::size_t kLargePage = std::size_t{2} << 20;
  if (size < kLargeMemory) {
    void* bytes = std::malloc(size == 0 ? 1 : size);
    if (bytes == nullptr) throw std::bad_alloc();
    return LargeBytes(static_cast<char*>(bytes), FreeBytes{});
  }
  const std::size_t whole = (size + kLargePage - 1) / kLargePage * kLargePage;
  if (whole < size || whole + kLargePage < whole) throw std::bad_alloc();
  void* mapped =
      ::mmap(nullptr, whole + kLargePage, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (mapped == MAP_FAILED) throw std::bad_alloc();
  // Large pages lie on multiples of their size; what is over on either side goes back.
  char* first = static_cast<char*>(mapped);
  const std::size_t before = (0 - reinterpret_cast<std::uintptr_t>(first)) & (kLargePage - 1);
  if (before > 0) ::munmap(first, before);
  if (before < kLargePage) ::munmap(first + before + whole, kLargePage - before);
  // Advice only: without large pages the memory is as good.
  static_cast<void>(::madvise(first + before, whole, MADV_HUGEPAGE));
  return LargeBytes(first + before, FreeBytes{whole});
}

}  // namespace gridbay
