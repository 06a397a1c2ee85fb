#pragma once

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <memory>
#include <span>
#include <type_traits>
#include <vector>

namespace gridbay {

// A long list of plain values, in blocks that copies share until one of them writes to a block. So a copy
// costs a pointer for each block, and so does a comparison; a change of one value costs its block.
template <class T>
class SharedArray {
  static_assert(std::is_trivially_copyable_v<T>);

 public:
  static constexpr std::size_t kBlock = 512;  // values in each block but the last

  std::size_t size() const { return size_; }
  bool empty() const { return size_ == 0; }
  // The place, from 0, must be in range.
  const T& operator[](std::size_t place) const { return (*blocks_[place / kBlock])[place % kBlock]; }
  // To be written to at once: a copy that is made shares the value again.
  T& edit(std::size_t place) { return own(place / kBlock)[place % kBlock]; }

  std::size_t blockCount() const { return blocks_.size(); }
  std::span<const T> block(std::size_t number) const { return *blocks_[number]; }

  void push_back(const T& value) {
    const std::size_t place = size_ / kBlock;
    if (place == blocks_.size()) blocks_.push_back(std::make_shared<Block>());
    own(place).push_back(value);
    ++size_;
  }
  void append(const SharedArray& other) {
    if (empty()) {
      *this = other;
      return;
    }
    const SharedArray values = other;  // which may be this one
    for (std::size_t number = 0; number < values.blockCount(); ++number) {
      for (const T& value : values.block(number)) push_back(value);
    }
  }
  // Drops values from the tail, or appends ones that are value-initialised.
  void resize(std::size_t size) {
    blocks_.resize(std::min(blocks_.size(), (size + kBlock - 1) / kBlock));
    size_ = std::min(size_, size);
    if (size_ % kBlock != 0) own(size_ / kBlock).resize(size_ % kBlock);
    while (size_ < size) {
      const std::size_t place = size_ / kBlock;
      if (place == blocks_.size()) blocks_.push_back(std::make_shared<Block>());
      const std::size_t length = std::min(kBlock, size - place * kBlock);
      own(place).resize(length);
      size_ = place * kBlock + length;
    }
  }
  void clear() { resize(0); }

  // Equal to the last bit, so that not-a-number is the same as itself.
  bool operator==(const SharedArray& other) const {
    return size_ == other.size_ &&
           std::equal(blocks_.begin(), blocks_.end(), other.blocks_.begin(), sameBlock);
  }

  // Memory of the blocks that the other one does not share.
  std::size_t bytesBeside(const SharedArray& other) const {
    std::size_t bytes = blocks_.size() * sizeof(blocks_.front());
    for (std::size_t number = 0; number < blocks_.size(); ++number) {
      if (number >= other.blocks_.size() || blocks_[number] != other.blocks_[number])
        bytes += blocks_[number]->capacity() * sizeof(T);
    }
    return bytes;
  }

 private:
  using Block = std::vector<T>;

  static bool sameBlock(const std::shared_ptr<Block>& a, const std::shared_ptr<Block>& b) {
    return a == b ||
           (a->size() == b->size() && std::memcmp(a->data(), b->data(), a->size() * sizeof(T)) == 0);
  }
  Block& own(std::size_t number) {
    std::shared_ptr<Block>& block = blocks_[number];
    if (block.use_count() > 1) block = std::make_shared<Block>(*block);
    return *block;
  }

  std::vector<std::shared_ptr<Block>> blocks_;
  std::size_t size_ = 0;
};

}  // namespace gridbay
