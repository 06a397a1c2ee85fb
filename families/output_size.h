#pragma once

namespace gridbay {

// Megabytes of a number of 4-byte values.
constexpr double megabytesOf(float values) {
  return double{values} * 4 / (1024.0 * 1024.0);
}

}  // namespace gridbay
