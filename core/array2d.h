#pragma once

#include <algorithm>
#include <cstddef>
#include <memory>
#include <span>
#include <utility>

namespace gridbay {

// A two-dimensional array with first and end index in J and K, J fastest in memory. Access with any indices
// is safe: out of range it gives the first element, or 0 when the array is empty. Copies share their elements
// until one of them is written to.
template <class T>
class CVdArray2D {
 public:
  CVdArray2D() = default;
  // Indices from 0; the elements have no values yet.
  CVdArray2D(int noJ, int noK)
      : endJ_(noJ),
        endK_(noK),
        values_(std::make_shared_for_overwrite<T[]>(static_cast<std::size_t>(noJ) *
                                                    static_cast<std::size_t>(noK))) {}
  CVdArray2D(const CVdArray2D&) = default;
  CVdArray2D& operator=(const CVdArray2D&) = default;
  CVdArray2D(CVdArray2D&& other) noexcept { *this = std::move(other); }
  CVdArray2D& operator=(CVdArray2D&& other) noexcept {
    std::swap(endJ_, other.endJ_);
    std::swap(endK_, other.endK_);
    std::swap(values_, other.values_);
    return *this;
  }
  ~CVdArray2D() = default;

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

  // To be written to: no other array shares the elements from here on, until one is copied.
  std::span<T> values() {
    if (values_.use_count() > 1) {
      CVdArray2D own(endJ_, endK_);
      std::ranges::copy(std::as_const(*this).values(), own.values_.get());
      *this = std::move(own);
    }
    return {values_.get(), size()};
  }
  std::span<const T> values() const { return {values_.get(), size()}; }

 private:
  std::size_t length() const { return static_cast<std::size_t>(endJ_); }
  std::size_t size() const { return length() * static_cast<std::size_t>(endK_); }

  int endJ_ = 0;
  int endK_ = 0;
  std::shared_ptr<T[]> values_;
};

}  // namespace gridbay
