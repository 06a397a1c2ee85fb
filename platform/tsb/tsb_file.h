#pragma once

#include <cstddef>
#include <memory>
#include <span>
#include <string>

#include "platform/result.h"
#include "platform/tsb/tsb_types.h"

namespace gridbay {

// A data file open for reading: netCDF-4 that follows the CF conventions. Each item is a variable with units,
// long name and item type; the axes are coordinate variables; the projection is a grid mapping; custom blocks
// are variables of a group. What the file says of its sizes is held against its length before anything is
// allocated for it.
class TsbFile {
 public:
  // An error names the file and what is wrong with it: not there, of another kind, without items, damaged.
  static Result<TsbFile> open(const std::string& path);

  // Looks at several files that are to be opened soon, which is quicker than at each when it is opened.
  static void lookAhead(std::span<const std::string> paths);

  TsbFile(TsbFile&&) noexcept;
  TsbFile& operator=(TsbFile&&) noexcept;
  ~TsbFile();

  const TsbDefinition& definition() const;
  const std::string& path() const;

  // One item (from 1) at one time step (from 0): definition().pointCount() values, x fastest, straight into
  // the caller's memory.
  Outcome read(std::size_t item, std::size_t step, std::span<float> values) const;
  Outcome read(std::size_t item, std::size_t step, std::span<double> values) const;

  // Rows `firstRow` and on (from 0) of a two-dimensional item; whole rows only.
  Outcome readRows(std::size_t item, std::size_t step, std::size_t firstRow, std::span<float> values) const;
  Outcome readRows(std::size_t item, std::size_t step, std::size_t firstRow, std::span<double> values) const;
  // All points of time steps `firstStep` and on; whole steps only.
  Outcome readSteps(std::size_t item, std::size_t firstStep, std::span<float> values) const;
  Outcome readSteps(std::size_t item, std::size_t firstStep, std::span<double> values) const;

 private:
  struct State;
  explicit TsbFile(std::unique_ptr<State> state);

  std::unique_ptr<State> state_;
};

}  // namespace gridbay
