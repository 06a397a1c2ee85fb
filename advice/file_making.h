#pragma once

#include <functional>
#include <string>
#include <variant>

#include "advice/grid_making.h"
#include "platform/result.h"

namespace gridbay {

// A data file as it is.
struct FileCopy {
  bool operator==(const FileCopy&) const = default;
};

// A time series whose missing values lie on the line between their neighbours.
struct FilledSeries {
  bool operator==(const FilledSeries&) const = default;
};

// How a data file is made of another one.
using FileMaking = std::variant<FileCopy, FilledSeries, PlacedGrid, ResampledGrid, LandValueGrid, TurnedGrid>;

// How much is done, 0 to 1; false stops the work.
using FileProgress = std::function<bool(double)>;

// Makes the file `to`, which is not there yet, or leaves nothing behind. An error says which file can't be
// read or written, and why.
Outcome makeFile(const FileCopy& making, const std::string& from, const std::string& to,
                 const FileProgress& progress);
Outcome makeFile(const FilledSeries& making, const std::string& from, const std::string& to,
                 const FileProgress& progress);

}  // namespace gridbay
