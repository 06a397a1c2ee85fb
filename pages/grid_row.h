#pragma once

#include <concepts>
#include <functional>

namespace gridbay {

// What a row of a grid stands for: an item, from 1, and in a grid of bands or blocks the row within that of
// the item, 0 for its title. Functions that need the item alone take an int.
struct GridRow {
  int item = 0;
  int sub = 0;

  operator int() const { return item; }
};

// A value that may differ from row to row: given as a value, or as a function of the row.
template <class Value>
class ByRow {
 public:
  ByRow() = default;
  template <std::convertible_to<Value> Fixed>
  ByRow(Fixed value) : of_([value = Value(std::move(value))](GridRow) { return value; }) {}
  template <class Function>
  requires(!std::convertible_to<Function, Value> && std::is_invocable_r_v<Value, Function, GridRow>)
      ByRow(Function function)
      : of_(std::move(function)) {}

  explicit operator bool() const { return static_cast<bool>(of_); }
  Value operator()(GridRow row) const { return of_ ? of_(row) : Value{}; }

 private:
  std::function<Value(GridRow)> of_;
};

}  // namespace gridbay
