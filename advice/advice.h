#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "advice/file_making.h"
#include "core/grid_point.h"
#include "core/page_place.h"
#include "setup/path_setting.h"

namespace gridbay {

// A data file that is made of another one; both by their absolute names.
struct AdviceFile {
  std::string from;
  std::string to;  // which is not there yet
  FileMaking making = FileCopy{};

  bool operator==(const AdviceFile&) const = default;
};

// What a fix takes out of a list, by its number from 1: an entry, with what all modules say of it, or the
// points of its line that lie where the one before them does.
struct AdviceRemoval {
  enum class List { boundary, source, weir, culvert, dike, output };
  enum class What { entry, equalPoints };

  List list;
  int number;
  What what = What::entry;

  bool operator==(const AdviceRemoval&) const = default;
};

// What mends a thing, whole or not at all: files that are made, then keywords with other values in their
// order, then what goes.
struct AdviceFix {
  std::string name;  // of the step, as in "Undo Move area 2"
  std::vector<Setting> settings = {};
  std::vector<AdviceFile> files = {};
  std::optional<AdviceRemoval> removal = {};

  bool operator==(const AdviceFix&) const = default;
};

// Where it lies: points of an area's grid, or points in a projection (metres).
struct AdviceSite {
  struct MapPoint {
    double easting = 0;
    double northing = 0;

    bool operator==(const MapPoint&) const = default;
  };

  int area = 0;  // from 1; 0 where there are no grid points
  std::vector<GridPoint> points = {};
  std::string projection = {};
  std::vector<MapPoint> mapPoints = {};

  bool operator==(const AdviceSite&) const = default;
};

// Something in a setup that is no fault and yet doubtful.
struct Advice {
  std::string_view kind;  // the rule that gave it, as "area-position"
  std::string doubt;      // what is doubtful, in a sentence
  std::string reason;     // why that matters
  PagePlace place;
  AdviceSite site = {};
  AdviceFix fix = {};

  bool operator==(const Advice&) const = default;
};

}  // namespace gridbay
