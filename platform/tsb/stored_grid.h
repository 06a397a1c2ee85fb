#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

#include "platform/files/file_descriptor.h"
#include "platform/result.h"

namespace gridbay {

// The values of a two-dimensional item at the first time step, read from where they lie in the file. Once it
// is open no library takes part, so that several threads may read while another one uses data files.
class StoredGrid {
 public:
  // An item (from 1). Errors are those of TsbFile, and: not two-dimensional, or packed and larger than
  // `kMostPacked` points, as a packed item is read at once.
  static constexpr std::size_t kMostPacked = std::size_t{1} << 24;
  static Result<StoredGrid> open(const std::string& path, std::size_t item);

  std::size_t columns() const { return columns_; }
  std::size_t rows() const { return rows_; }
  // Stands for a missing value.
  float missing() const { return missing_; }
  // Points of a row (from 0) from a column on. False where the file can't be read any more.
  bool read(std::size_t row, std::size_t firstColumn, std::span<float> values) const;

 private:
  StoredGrid(FileDescriptor file, std::size_t columns, std::size_t rows, float missing)
      : file_(std::move(file)), columns_(columns), rows_(rows), missing_(missing) {}

  FileDescriptor file_;
  std::size_t columns_;
  std::size_t rows_;
  float missing_;
  std::uint64_t place_ = 0;  // of the first value in the file
  bool isDouble_ = false;
  std::vector<float> unpacked_;  // instead of the file
};

}  // namespace gridbay
