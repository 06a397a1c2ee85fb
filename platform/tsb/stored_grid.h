#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>
#include <vector>

#include "platform/files/file_descriptor.h"
#include "platform/result.h"
#include "platform/tsb/packed_grid.h"

namespace gridbay {

// The values of a two-dimensional item at the first time step, read from where they lie in the file. Once it
// is open no library takes part, so that several threads may read while another one uses data files.
class StoredGrid {
 public:
  // What the data file library says of an item.
  struct Source {
    std::string path;
    std::size_t item = 1;  // from 1
    std::size_t columns = 0;
    std::size_t rows = 0;
    float missing = 0;
  };
  // Errors are those of TsbFile, and: not two-dimensional, no such item.
  static Result<Source> find(const std::string& path, std::size_t item);

  // What is packed in a way of its own, or in larger pieces than this, is read at once, and has no more
  // points than this; what is packed as usual is read in parts.
  static constexpr std::size_t kMostAtOnce = std::size_t{1} << 24;
  // A larger packed item gets an overview of at most about so many points.
  static constexpr std::size_t kOverviewPoints = std::size_t{1} << 22;
  // Told how much is done, 0 to 1; false to cancel it.
  using Progress = std::function<bool(double done)>;
  // Opens what was found. It may be called in any thread where `opensInAnyThread`, and takes long for large
  // packed items; `progress` is asked every few rows. Errors: it was cancelled, the values can't be reached.
  static Result<StoredGrid> open(const Source& source, const Progress& progress = {});
  static Result<StoredGrid> open(const std::string& path, std::size_t item);
  static bool opensInAnyThread();

  std::size_t columns() const { return source_.columns; }
  std::size_t rows() const { return source_.rows; }
  // Stands for a missing value.
  float missing() const { return source_.missing; }
  // Points of a row (from 0) from a column on. Where no more than every `apart`-th point is looked at, they
  // may be those of the nearest point of the overview. False where the file can't be read any more.
  bool read(std::size_t row, std::size_t firstColumn, std::span<float> values, double apart = 1) const;
  // One value, for who can't wait: false also where it would have to be unpacked first.
  bool readAtOnce(std::size_t row, std::size_t column, float& value) const;

 private:
  explicit StoredGrid(FileDescriptor file, Source source)
      : file_(std::move(file)), source_(std::move(source)) {}
  Outcome makeOverview(const Progress& progress);

  FileDescriptor file_;
  Source source_;
  std::uint64_t place_ = 0;  // of the first value in the file
  bool isDouble_ = false;
  // Instead of the file:
  std::vector<float> unpacked_;
  std::unique_ptr<const PackedGrid> packed_;
  std::vector<float> overview_;  // every n-th point of every n-th row
  std::size_t overviewStep_ = 0;
  std::size_t overviewColumns_ = 0;
};

}  // namespace gridbay
