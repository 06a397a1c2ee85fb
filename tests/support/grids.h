#pragma once

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "platform/tsb/tsb_types.h"

namespace gridbay::test {

// A grid file as an area wants it; a test changes what it is about.
struct GridSpec {
  int noJ = 10;
  int noK = 8;
  double dx = 30;
  double dy = 30;
  std::optional<float> land = 10.0F;
  int itemType = 100079;
  int dataType = 0;
  int items = 1;
  int steps = 1;
  std::string unit = "m";
  std::string axisUnit = "m";
  std::optional<TsbGeography> geography = {};
  TsbTimeAxis time = {};
  std::vector<TsbCustomBlock> blocks = {};
};

// Elevation of a point.
using Surface = std::function<float(int j, int k)>;

inline float flat(int, int) {
  return -5.0F;
}

TsbDefinition definitionOf(const GridSpec& spec);

// Writes every item of every step with the surface; a hot start file's first item says where the area lies.
void writeGrid(const std::string& path, const GridSpec& spec = {}, const Surface& surface = flat);
void writeHotStart(const std::string& path, GridSpec spec, const Surface& surface, int enclosing, int originJ,
                   int originK);

// Writes zeros to every item and step.
void writeFile(const std::string& path, const TsbDefinition& definition);

// A time series of zeros.
void writeSeries(const std::string& path, const TsbTimeAxis& time, int itemType, const std::string& unit,
                 int items = 1);

}  // namespace gridbay::test
