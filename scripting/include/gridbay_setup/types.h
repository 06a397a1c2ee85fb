#pragma once

#include <functional>
#include <string>

// What the scripting classes take and give beside numbers, texts and vectors.

namespace gridbay::scripting {

// A date-time as a day number with a status. Day 0 is 1899-12-30 00:00, the fraction is the time of day; a
// negative day number holds its time of day as a positive fraction, so that -1.25 is 06:00 on 1899-12-29.
// Status 0 is valid, 1 is not.
struct DateTime {
  double day = 0;
  int status = 0;

  bool operator==(const DateTime&) const = default;
};

// How many boundaries or sources a script can make, as many as the editor.
inline constexpr int kMostObjects = 65535;

// Where a member that goes through the outputs is: at output `number`, from 1. A null position is behind the
// last one.
struct OutputPosition {
  int number = 0;

  explicit operator bool() const { return number != 0; }
  bool operator==(const OutputPosition&) const = default;
};

// Takes the place of a message box: is given the whole text, and returns when it has been seen. Without one
// texts go to standard error.
using MessageBox = std::function<void(const std::string& text)>;

}  // namespace gridbay::scripting
