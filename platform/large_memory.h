#pragma once

#include <cstddef>
#include <cstdlib>
#include <memory>

namespace gridbay {

struct FreeBytes {
  void operator()(char* bytes) const { std::free(bytes); }
};
using LargeBytes = std::unique_ptr<char[], FreeBytes>;

// Memory that is not set to anything. A large piece is asked of the system in large pages, which take far
// less time to come by than many small ones. Throws std::bad_alloc.
LargeBytes allocateBytes(std::size_t size);

}  // namespace gridbay
