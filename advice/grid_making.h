#pragma once

#include <cstddef>
#include <functional>
#include <optional>
#include <string>

#include "core/grid_point.h"
#include "platform/result.h"

// Data files of fixes that are made of another grid: all of its items and blocks but for what is said.

namespace gridbay {

// Where a grid file says that its points lie.
struct GridLocation {
  std::string projection = {};  // empty for local coordinates
  double longitude = 0;         // of the first point, degrees
  double latitude = 0;
  double rotation = 0;  // of K, degrees clockwise from north
  double firstX = 0;    // what its axes begin with, metres
  double firstY = 0;

  bool operator==(const GridLocation&) const = default;
};

// What a hot start file says of its area.
struct HotStartPlace {
  int enclosing = 0;  // from 1
  GridPoint origin = {};

  bool operator==(const HotStartPlace&) const = default;
};

// The same points, which lie elsewhere by what the file says.
struct PlacedGrid {
  std::optional<GridLocation> location = {};
  std::optional<HotStartPlace> hotStart = {};

  bool operator==(const PlacedGrid&) const = default;
};

// As many points elsewhere, with the values that the grid has there. A point of which some neighbours are
// land or missing takes the nearest one; beyond the grid, elevations are those of the grid around it.
struct ResampledGrid {
  GridLocation location = {};
  double dx = 0;  // metres
  double dy = 0;
  std::string around = {};  // the file of the grid around it

  bool operator==(const ResampledGrid&) const = default;
};

// The same grid with another land value (metres).
struct LandValueGrid {
  float landValue = 0;
  std::size_t item = 0;  // whose points at a lower value of old stay land; 0 for none

  bool operator==(const LandValueGrid&) const = default;
};

// An item (from 1) with the other sign, as depths become elevations.
struct TurnedGrid {
  std::size_t item = 1;

  bool operator==(const TurnedGrid&) const = default;
};

// As all makings of a file (advice/file_making.h).
Outcome makeFile(const PlacedGrid& making, const std::string& from, const std::string& to,
                 const std::function<bool(double)>& progress);
Outcome makeFile(const ResampledGrid& making, const std::string& from, const std::string& to,
                 const std::function<bool(double)>& progress);
Outcome makeFile(const LandValueGrid& making, const std::string& from, const std::string& to,
                 const std::function<bool(double)>& progress);
Outcome makeFile(const TurnedGrid& making, const std::string& from, const std::string& to,
                 const std::function<bool(double)>& progress);

}  // namespace gridbay
