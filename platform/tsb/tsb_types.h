#pragma once

#include <array>
#include <cmath>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace gridbay {

// The kinds of time axis, by the numbers that requests use.
enum class TsbTimeAxisType {
  relativeEquidistant = 1,
  relative = 2,
  calendarEquidistant = 3,
  calendar = 4,
};

// The kinds of spatial axis; all are equidistant.
enum class TsbAxisType { d0 = 1, d1 = 3, d2 = 5 };

// When the time steps are. A calendar axis counts from its start; a relative axis need not be one of time: a
// rating curve has levels there.
struct TsbTimeAxis {
  TsbTimeAxisType type = TsbTimeAxisType::calendarEquidistant;
  std::array<std::int32_t, 6> start{1990, 1, 1, 12, 0, 0};  // year to second, of a calendar axis
  std::string unit = "s";
  double first = 0;  // of an equidistant axis, in the unit
  double step = 1;   // of an equidistant axis, in the unit
  std::size_t count = 1;
  std::vector<double> values;  // of a non-equidistant axis, in the unit; `count` of them

  bool isCalendar() const {
    return type == TsbTimeAxisType::calendarEquidistant || type == TsbTimeAxisType::calendar;
  }
  bool isEquidistant() const {
    return type == TsbTimeAxisType::calendarEquidistant || type == TsbTimeAxisType::relativeEquidistant;
  }
  double at(std::size_t i) const {
    return isEquidistant() ? first + static_cast<double>(i) * step : values[i];
  }
};

// Grid points along one direction: the coordinate of the first, the spacing, the unit of both.
struct TsbGridAxis {
  std::size_t points = 0;
  double first = 0;
  double spacing = 1;
  std::string unit = "m";
};

struct TsbItem {
  std::string name;
  int type = 999;  // item code of the units library
  std::string unit = "1";
  bool isDouble = false;
  double deleteValue = -1e-35;  // stands for a missing value
};

// Where a grid lies: the projection's text, longitude and latitude of the first point, and the direction of
// K in degrees clockwise from the projection's north. A grid that is turned has axes of its own, in metres
// from the first point.
struct TsbGeography {
  std::string projection;
  double longitude = 0;
  double latitude = 0;
  double rotation = 0;

  bool isTurned() const {
    constexpr double kNoRotation = 1e-6;
    return std::abs(rotation) >= kNoRotation;
  }
};

// A named row of numbers that belongs to the file as a whole.
struct TsbCustomBlock {
  std::string name;
  std::vector<float> values;
  bool readable = true;
};

// All of a data file but its values. `axes` has none, one (x) or two (x, y) directions; x is fastest.
struct TsbDefinition {
  std::string title;
  std::string history;  // how the file came about, a line for each step; for people
  int dataType = 0;
  TsbTimeAxis time;
  std::vector<TsbGridAxis> axes;
  std::vector<TsbItem> items;
  std::vector<TsbCustomBlock> customBlocks;
  std::optional<TsbGeography> geography;

  TsbAxisType axisType() const {
    return axes.empty() ? TsbAxisType::d0 : axes.size() == 1 ? TsbAxisType::d1 : TsbAxisType::d2;
  }
  // Values in one item of one time step.
  std::size_t pointCount() const {
    std::size_t points = 1;
    for (const TsbGridAxis& axis : axes) points *= axis.points;
    return points;
  }
};

}  // namespace gridbay
