#pragma once

#include <cstddef>
#include <memory>
#include <span>
#include <string>

#include "platform/result.h"
#include "platform/tsb/tsb_types.h"

namespace gridbay {

// Makes a data file. The file has its name only once `commit` has succeeded; until then, and when anything
// fails, a file that was there before is as it was.
class TsbWriter {
 public:
  static Result<TsbWriter> create(const std::string& path, const TsbDefinition& definition);

  TsbWriter(TsbWriter&&) noexcept;
  TsbWriter& operator=(TsbWriter&&) = delete;
  ~TsbWriter();

  // One item (from 1) at one time step (from 0), x fastest; of a series, at that step and those that follow.
  Outcome write(std::size_t item, std::size_t step, std::span<const float> values);
  Outcome write(std::size_t item, std::size_t step, std::span<const double> values);
  // Rows `firstRow` and on of a two-dimensional item; whole rows only.
  Outcome writeRows(std::size_t item, std::size_t step, std::size_t firstRow, std::span<const float> values);
  Outcome writeRows(std::size_t item, std::size_t step, std::size_t firstRow, std::span<const double> values);
  Outcome commit();

 private:
  struct State;
  explicit TsbWriter(std::unique_ptr<State> state);

  std::unique_ptr<State> state_;
};

}  // namespace gridbay
