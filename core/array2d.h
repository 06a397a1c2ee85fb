#pragma once

#include <algorithm>
#include <cstddef>
#include <memory>
#include <span>

namespace gridbay {

// An owned two-dimensional array with first and end index in J and K, J fastest in memory. Access with any
// indices is safe: out of range it gives the first element, or 0 when the array is empty.
template <class T>
class CVdArray2D {
 public:
  CVdArray2D() = default;
  // Indices from 0; the elements have no values yet.
  CVdArray2D(int noJ, int noK)
      : endJ_(noJ),
        endK_(noK),
        values_(std::make_unique_for_overwrite<T[]>(static_cast<std::size_t>(noJ) *
                                                    static_cast<std::size_t>(noK))) {}
  CVdArray2D(const CVdArray2D& other) : CVdArray2D(other.endJ_, other.endK_) {
    std::ranges::copy(other.values(), values_.get());
  }
  CVdArray2D(CVdArray2D&& other) noexcept { *this = std::move(other); }
  CVdArray2D& operator=(const CVdArray2D& other) { return *this = CVdArray2D(other); }
  CVdArray2D& operator=(CVdArray2D&& other) noexcept {
    std::swap(endJ_, other.endJ_);
    std::swap(endK_, other.endK_);
    std::swap(values_, other.values_);
    return *this;
  }

  int firstJ() const { return 0; }
  int firstK() const { return 0; }
  // One past the last index.
  int endJ() const { return endJ_; }
  int endK() const { return endK_; }
  bool empty() const { return endJ_ == 0 || endK_ == 0; }
  bool contains(int j, int k) const { return j >= 0 && j < endJ_ && k >= 0 && k < endK_; }

  T operator()(int j, int k) const {
    if (empty()) return T();
    return contains(j, k) ? row(k)[static_cast<std::size_t>(j)] : values_[0];
  }
  // K must be in range.
  std::span<const T> row(int k) const {
    return {values_.get() + static_cast<std::size_t>(k) * length(), length()};
  }

  std::span<T> values() { return {values_.get(), length() * static_cast<std::size_t>(endK_)}; }
  std::span<const T> values() const { return {values_.get(), length() * static_cast<std::size_t>(endK_)}; }

 private:
  std::size_t length() const { return static_cast<std::size_t>(endJ_); }

  int endJ_ = 0;
  int endK_ = 0;
  std::unique_ptr<T[]> values_;
};

}  // namespace gridbay
