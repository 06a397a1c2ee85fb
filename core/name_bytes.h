#pragma once

#include <cstdint>
#include <cstring>
#include <string_view>

// Names as machine words, with the letters A to Z made small.

namespace gridbay::names {

inline std::uint64_t foldCase(std::uint64_t bytes) {
  constexpr std::uint64_t kHigh = 0x8080808080808080U;
  constexpr std::uint64_t kEach = 0x0101010101010101U;
  const std::uint64_t low = bytes & ~kHigh;
  const std::uint64_t fromA = low + kEach * (0x80 - 'A');
  const std::uint64_t pastZ = low + kEach * (0x7F - 'Z');
  const std::uint64_t upper = fromA & ~pastZ & ~bytes & kHigh;
  return bytes | (upper >> 2);
}

inline std::uint64_t load8(const char* from) {
  std::uint64_t bytes = 0;
  std::memcpy(&bytes, from, 8);
  return bytes;
}

// Up to eight bytes as a number that tells them apart from any others of the same length.
inline std::uint64_t loadUpTo8(const char* from, std::size_t count) {
  if (count >= 4) {
    std::uint32_t head = 0;
    std::uint32_t tail = 0;
    std::memcpy(&head, from, 4);
    std::memcpy(&tail, from + count - 4, 4);
    return std::uint64_t{tail} << 32 | head;
  }
  if (count == 0) return 0;
  const auto byte = [from](std::size_t i) { return std::uint64_t{static_cast<unsigned char>(from[i])}; };
  return byte(0) | byte(count / 2) << 8 | byte(count - 1) << 16;
}

inline bool same(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) return false;
  std::size_t i = 0;
  for (; i + 8 <= a.size(); i += 8) {
    if (foldCase(load8(a.data() + i)) != foldCase(load8(b.data() + i))) return false;
  }
  return foldCase(loadUpTo8(a.data() + i, a.size() - i)) == foldCase(loadUpTo8(b.data() + i, b.size() - i));
}

// A name without the blanks at its end, of which no lookup takes notice.
inline std::string_view trimmed(std::string_view name) {
  while (!name.empty() && name.back() == ' ') name.remove_suffix(1);
  return name;
}

// Whether a name that may end in blanks is the trimmed one.
inline bool sameTrimmed(std::string_view name, std::string_view wanted) {
  if (name.size() <= wanted.size()) return same(name, wanted);
  return name.back() == ' ' && same(trimmed(name), wanted);
}

}  // namespace gridbay::names
