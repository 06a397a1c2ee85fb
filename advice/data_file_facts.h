#pragma once

#include <array>
#include <chrono>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "advice/series_mending.h"
#include "core/array2d.h"
#include "core/grid_point.h"
#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_types.h"

namespace gridbay {

// What advice has to know of a grid file. Elevations in metres.
struct GridFacts {
  TsbDefinition file;
  int noJ = 0;
  int noK = 0;
  double dx = 0;  // metres
  double dy = 0;
  float landValue = 0;  // below 0 where the file has none
  float lowest = 0;
  float highest = 0;
  // Points that lie at the land value itself, as those do whose values were missing, and others.
  std::size_t pointsAtLand = 0;
  std::size_t pointsAboveSea = 0;
  float highestOfOthers = 0;
  // The border, by rising J or K.
  std::vector<float> west, east, south, north;
  // The lowest and the highest value of each square block of points, which is a single point unless the grid
  // is large; where values are missing the highest is infinite.
  int blockSize = 1;
  CVdArray2D<float> lowestOfBlocks;
  CVdArray2D<float> highestOfBlocks;
  std::vector<float> lowestOfRows;     // of blocks
  CVdArray2D<std::uint32_t> lowestAt;  // its place in its block, row by row; empty where each is a point

  // Whether a point of the border is water.
  bool isWaterAtBorder(int j, int k) const;
  bool isOnBorder(int j, int k) const { return j == 0 || k == 0 || j == noJ - 1 || k == noK - 1; }
  bool contains(int j, int k) const { return j >= 0 && k >= 0 && j < noJ && k < noK; }
  // Where the lowest value of a block is.
  GridPoint lowestPoint(int blockJ, int blockK) const;
};

// What advice has to know of a file whose values go on in time.
struct SeriesFacts {
  struct Item {
    std::size_t missing = 0;
    std::size_t firstMissing = 0;  // its time step
    float highest = -INFINITY;
    // Of a profile that of its first point. Gaps lie on the line between their neighbours.
    std::optional<SeriesJump> jump = {};
    std::size_t jumping = 0;  // values that are others without jumps
    // A value that stands apart from all others of a series, and its time step.
    std::optional<std::pair<std::size_t, double>> apart = {};
  };

  TsbDefinition file;
  bool hasValues = false;  // false for a file with too many values to look at
  std::vector<Item> items;
};

// The facts of data files and projections, each read once for as long as its file is as it was. A fact that
// is not known yet is null, and is read by the next calls of `read`, a piece at a time.
class DataFileFacts {
 public:
  DataFileFacts();
  ~DataFileFacts();

  // The item (from 1) of a grid file, and all items of a file of series; null while it is unknown, and for
  // good where the file can't be read.
  const GridFacts* grid(const std::string& path, std::size_t item);
  const SeriesFacts* series(const std::string& path);
  const CVdMapProjection& projection(const std::string& text) { return known(text).projection; }
  // Its full text, by which projections are told apart; empty where there is no such projection.
  const std::string& fullText(const std::string& text) { return known(text).fullText; }

  // Reads what was asked for and is not known yet, until that is done, which is true, or the time is over.
  bool read(std::chrono::milliseconds time);
  bool isComplete() const;
  // Forgets what was not asked for since the last call; what was given before it holds no longer.
  void forgetUnused();

 private:
  struct Entry;
  struct KnownProjection {
    CVdMapProjection projection;
    std::string fullText;
  };
  const KnownProjection& known(const std::string& text);
  Entry& entry(const std::string& path, std::size_t item);

  std::map<std::pair<std::string, std::size_t>, std::unique_ptr<Entry>> entries_;
  std::map<std::string, KnownProjection> projections_;
};

}  // namespace gridbay
