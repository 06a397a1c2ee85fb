#pragma once

#include <cstdint>
#include <string>
#include <tuple>
#include <vector>

#include "hydrodynamic/result.h"
#include "scripting/scripted_model.h"

namespace gridbay {

// An output as scripts have it. Type 0 is a map, 1 is of points; grid points from 0.
struct FloodOutput {
  int type = 0;
  int useSubArea = 0;
  int firstJ = 0;
  int firstK = 0;
  int lastJ = 0;
  int lastK = 0;
  std::vector<double> pointsJ;
  std::vector<double> pointsK;
  int usePeriod = 0;
  scripting::DateTime firstDate;
  scripting::DateTime lastDate;
  int frequency = 1;  // in time steps
  std::string fileName;
  std::string title;
  std::vector<std::int32_t> items;

  // All of it, in the order in which members take and give it.
  auto fields() {
    return std::tie(type, useSubArea, firstJ, firstK, lastJ, lastK, pointsJ, pointsK, usePeriod, firstDate,
                    lastDate, frequency, fileName, title, items);
  }
};

// Appends an output and returns it. A type that is none is taken for a map.
CNhdResultObjectKvs& appendOutput(ScriptedModel& model, const FloodOutput& output);
// Shows that a type is none, as the last thing that a member does: the model is free for that time.
void tellUnsupported(ScriptedModel& model, int type);

// Gives the output at the position and steps on. What the output does not have keeps its value. The result is
// its type as a script has it, kNoType for one that has none. Throws std::invalid_argument where no output is
// at the position.
inline constexpr int kNoType = -1;
int readOutput(ScriptedModel& model, scripting::OutputPosition& position, FloodOutput& output);

// The whole number that a real one begins with, at most as large as there is one; 0 for what is no number.
std::int32_t wholePart(double number);
// Whole seconds between two moments, and how many time steps they are; steps in seconds.
double wholeSeconds(DateTime from, DateTime to);
std::int32_t wholeSteps(double seconds, double timeStep);

}  // namespace gridbay
