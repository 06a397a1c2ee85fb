#pragma once

#include <cstdint>
#include <map>
#include <optional>
#include <string>

#include "platform/files/file_stamp.h"
#include "platform/tsb/tsb_types.h"

namespace gridbay {

// What a grid file says of an area without its values.
struct GridHeader {
  std::int32_t nx = 0;  // points along J
  std::int32_t ny = 0;
  double dx = 0;  // metres
  double dy = 0;
  double firstX = 0;  // the first value of its axes
  double firstY = 0;
  float landValue = 0;
  std::optional<TsbGeography> geography;  // its projection complete
  std::uint64_t state = 0;                // another one when the file has been written to
  std::string fault;                      // why it is no grid; then the rest is without meaning
};

// The headers of grid files, each read once and again when the file has been written to.
class GridHeaders {
 public:
  // Of a file by its absolute name; until it has changed and is asked for again.
  const GridHeader& of(const std::string& path);

 private:
  struct Known {
    std::optional<FileStamp> stamp;
    GridHeader header;
  };
  std::map<std::string, Known, std::less<>> known_;
  std::uint64_t lastState_ = 0;
};

}  // namespace gridbay
