#include "scripting/flood_outputs.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"

namespace gridbay {
namespace {

constexpr double kSecondsOfDay = 86400;
constexpr double kHalfSecond = 5.787037037037037e-6;  // in days
constexpr int kMapType = 0;
constexpr int kPointsType = 1;
constexpr const char* kUnsupportedType = "Unsupported output type";

// Days as one straight line: those before day 0 have their time of day the other way round.
double straightDays(DateTime moment) {
  if (moment.day > -kHalfSecond) return moment.day;
  const double whole = std::ceil(moment.day);
  return whole - (moment.day - whole);
}

bool isWholeGrid(const CNhdResultObjectKvs& output, const CBathymetryObjectKvs* area) {
  const auto& [x, y] = output.part;
  if (x.last == -1 && y.last == -1) return true;
  return area != nullptr && x.first == 0 && y.first == 0 && x.last == area->noJ - 1 &&
         y.last == area->noK - 1;
}

}  // namespace

std::int32_t wholePart(double number) {
  using Limits = std::numeric_limits<std::int32_t>;
  if (std::isnan(number)) return 0;
  return static_cast<std::int32_t>(std::clamp<double>(number, Limits::min(), Limits::max()));
}

double wholeSeconds(DateTime from, DateTime to) {
  const double days = straightDays(to) - straightDays(from);
  return std::trunc((days < 0 ? days - kHalfSecond : days + kHalfSecond) * kSecondsOfDay);
}

std::int32_t wholeSteps(double seconds, double timeStep) {
  constexpr double kSlack = 0.0001;
  return wholePart((seconds + kSlack) / timeStep);
}

void tellUnsupported(ScriptedModel& model, int type) {
  if (type != kMapType && type != kPointsType) model.show(kUnsupportedType);
}

CNhdResultObjectKvs& appendOutput(ScriptedModel& model, const FloodOutput& given) {
  CSimulationPeriodKvs& simulation = *model.root.simulationPeriod;
  auto& outputs = model.root.nhdResult->outputs;
  outputs.SetCount(outputs.GetCount() + 1);
  CNhdResultObjectKvs& output = outputs.at(outputs.GetCount());
  if (given.type == kMapType) {
    output.type = CNhdResultObjectKvs::kMap;
  } else if (given.type == kPointsType) {
    output.type = CNhdResultObjectKvs::kPoints;
  }
  model.setFileName(output.file, given.fileName);
  output.title = given.title;
  output.items = given.items;
  if (output.type == CNhdResultObjectKvs::kMap && given.useSubArea != 0)
    output.part = {{given.firstJ, given.lastJ, 1}, {given.firstK, given.lastK, 1}};
  if (output.type == CNhdResultObjectKvs::kPoints && !given.pointsJ.empty() && !given.pointsK.empty()) {
    output.pointsJ = given.pointsJ;
    output.pointsK = given.pointsK;
  }
  output.steps = {0, simulation.LastTimeStep(), std::max(given.frequency, 1)};
  if (given.usePeriod != 0) {
    const auto stepOf = [&simulation](DateTime moment) {
      return wholeSteps(wholeSeconds(simulation.start, moment), double{simulation.timeStepInterval});
    };
    output.steps.first = stepOf(modelTime(given.firstDate));
    output.steps.last = stepOf(modelTime(given.lastDate));
  }
  return output;
}

int readOutput(ScriptedModel& model, scripting::OutputPosition& position, FloodOutput& given) {
  const CSimulationPeriodKvs& simulation = *model.root.simulationPeriod;
  auto& outputs = model.root.nhdResult->outputs;
  const CNhdResultObjectKvs& output = outputs.at(position.number);
  position.number = position.number < outputs.GetCount() ? position.number + 1 : 0;

  given.fileName = output.file.text();
  given.title = output.title;
  given.items = output.items;
  const int type = output.type == CNhdResultObjectKvs::kMap      ? kMapType
                   : output.type == CNhdResultObjectKvs::kPoints ? kPointsType
                                                                 : kNoType;
  if (type != kNoType) given.type = type;
  if (type == kPointsType) {
    given.pointsJ = output.pointsJ;
    given.pointsK = output.pointsK;
  } else if (type == kMapType) {
    const bool isWhole =
        isWholeGrid(output, model.root.bathymetry->GetItem(CNhdResultObjectKvs::kAreaNumber));
    given.useSubArea = isWhole ? 0 : 1;
    if (!isWhole) {
      given.firstJ = output.part.x.first;
      given.lastJ = output.part.x.last;
      given.firstK = output.part.y.first;
      given.lastK = output.part.y.last;
    }
  }

  const bool isAllSteps =
      output.steps.first == 0 && output.steps.last == simulation.LastTimeStep() && output.steps.interval == 1;
  given.usePeriod = isAllSteps ? 0 : 1;
  if (!isAllSteps) {
    const auto momentOf = [&simulation](std::int32_t step) {
      const float seconds = static_cast<float>(step) * simulation.timeStepInterval;
      return simulation.start.plusDays(std::trunc(double{seconds}) / kSecondsOfDay);
    };
    given.frequency = output.steps.interval;
    given.firstDate = scriptTime(momentOf(output.steps.first));
    given.lastDate = scriptTime(momentOf(output.steps.last));
  }
  return type;
}

}  // namespace gridbay
