#pragma once

#include <functional>
#include <string>
#include <vector>

#include "platform/result.h"

namespace gridbay {

// Points that lie anywhere, with a value each.
struct PointSet {
  std::vector<double> x;  // eastings, or longitudes
  std::vector<double> y;
  std::vector<double> z;

  // Between neighbours, where the points were spread evenly over their extent; in the unit of the
  // coordinates.
  double meanDistance() const;
  // No triangle can be made of them.
  bool areInLine() const;
};

// Whether a file begins as a text of points does: with three numbers on a line, below one heading at most.
bool holdsPoints(const std::string& path);
// Whether it begins with fewer of them, as a table of pairs does.
bool holdsNumbers(const std::string& path);

// Reads points from a text, one on a line: numbers between semicolons, tabs, commas or blanks, as the first
// line has them; between all but commas a number may have a decimal comma. A heading may name the columns in
// any order (x, y, z, or easting, northing, elevation and the like); else they are the first three. Empty
// lines, those that begin with # and points whose value is "nan" are passed over. An error tells the number
// of the line, from 1; so does a progress (0 to 1) that says no.
Result<PointSet> readPoints(const std::string& path, const std::function<bool(double)>& progress = {});

}  // namespace gridbay
