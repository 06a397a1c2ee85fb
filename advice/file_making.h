#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <variant>
#include <vector>

#include "advice/grid_making.h"
#include "core/date_time.h"
#include "platform/result.h"

namespace gridbay {

// A data file as it is.
struct FileCopy {
  bool operator==(const FileCopy&) const = default;
};

// A time series or profile whose missing values lie on the line between their neighbours in time, at each
// point. A point with no value has those of the nearest one, an item with none is 0.
struct FilledSeries {
  std::vector<std::uint32_t> apart =
      {};  // items (from 1) whose value that stands apart is one of the missing

  bool operator==(const FilledSeries&) const = default;
};

// The same without the jumps of some items (from 1).
struct SmoothedSeries {
  std::vector<std::uint32_t> items;

  bool operator==(const SmoothedSeries&) const = default;
};

// A file whose values go through a run: moved in time to begin with it, or with its own times, and with the
// last values held until the run's end where they end before it: once more there, or at each step of an axis
// that keeps its equal ones.
struct CoveringSeries {
  DateTime begin;  // of the run
  DateTime end;
  bool isMoved = false;
  bool keepsSteps = false;

  bool operator==(const CoveringSeries&) const = default;
};

// How a data file is made of another one.
using FileMaking = std::variant<FileCopy, FilledSeries, SmoothedSeries, CoveringSeries, PlacedGrid,
                                ResampledGrid, LandValueGrid, TurnedGrid>;

// How much is done, 0 to 1; false stops the work.
using FileProgress = std::function<bool(double)>;

// Makes the file `to`, which is not there yet, or leaves nothing behind. An error says which file can't be
// read or written, and why.
Outcome makeFile(const FileCopy& making, const std::string& from, const std::string& to,
                 const FileProgress& progress);
Outcome makeFile(const FilledSeries& making, const std::string& from, const std::string& to,
                 const FileProgress& progress);
Outcome makeFile(const SmoothedSeries& making, const std::string& from, const std::string& to,
                 const FileProgress& progress);
Outcome makeFile(const CoveringSeries& making, const std::string& from, const std::string& to,
                 const FileProgress& progress);

}  // namespace gridbay
