#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <utility>
#include <vector>

#include "platform/large_memory.h"

namespace gridbay {

// Memory that is handed out piece by piece and freed all at once. What is made here is never destroyed: it
// must have nothing to free.
class Arena {
 public:
  // The size of the first block; the next ones grow from there.
  explicit Arena(std::size_t firstBlock) : nextBlock_(firstBlock) {}

  char* bytes(std::size_t size) {
    if (size > left_) grow(size);
    char* piece = at_;
    at_ += size;
    left_ -= size;
    return piece;
  }

  // Room for `count` things of a type, each yet to be made.
  template <class T>
  T* room(std::size_t count = 1) {
    const std::size_t size = count * sizeof(T);
    std::size_t gap = (0 - reinterpret_cast<std::uintptr_t>(at_)) & (alignof(T) - 1);
    if (gap + size > left_) {
      grow(size);
      gap = 0;  // a new block is aligned for anything
    }
    return reinterpret_cast<T*>(bytes(gap + size) + gap);
  }

  template <class T, class... Args>
  T* make(Args&&... args) {
    return std::construct_at(room<T>(), std::forward<Args>(args)...);
  }

 private:
  void grow(std::size_t size) {
    constexpr std::size_t kLargestBlock = std::size_t{32} << 20;
    const std::size_t block = std::max(size, nextBlock_);
    blocks_.push_back(allocateBytes(block));
    at_ = blocks_.back().get();
    left_ = block;
    nextBlock_ = std::min(std::max(nextBlock_, kLargestBlock / 64) * 2, kLargestBlock);
  }

  std::vector<LargeBytes> blocks_;
  std::size_t nextBlock_;
  char* at_ = nullptr;
  std::size_t left_ = 0;
};

}  // namespace gridbay
