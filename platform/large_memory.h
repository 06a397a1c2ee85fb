#pragma once

#include <cstddef>
#include <memory>

namespace gridbay {

struct FreeBytes {
  std::size_t mapped = 0;  // the size of memory that is the system's own, 0 for memory of the heap
  void operator()(char* bytes) const;
};
using LargeBytes = std::unique_ptr<char[], FreeBytes>;

// From this size on memory comes from the system in large pages, which take far less time to come by than
// many small ones, and goes back to it at once.
inline constexpr std::size_t kLargeMemory = std::size_t{4} << 20;

// Memory that is not set to anything. Throws std::bad_alloc.
LargeBytes allocateBytes(std::size_t size);

}  // namespace gridbay
