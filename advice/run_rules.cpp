// Doubts about the run: its time step, its thresholds, its warm-up, and values that no engine takes.

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

#include "advice/rules.h"
#include "advice/run_steps.h"
#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/letters.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wind_conditions.h"
#include "setup/member_keyword.h"
#include "setup/page_places.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

PagePlace onPeriod(std::string_view keyword, std::string_view field, int fieldNumber = 1) {
  return {PageId::simulationPeriod,
          {},
          fmt::format("{}/{}", kPeriodPath, keyword),
          std::string(field),
          fieldNumber};
}

struct Deepest {
  double depth = 0;
  GridPoint point;
};

// The deepest point that no embedded area covers. Of a large grid whole blocks are looked at, without those
// that are covered in part.
Deepest deepestOf(AdviceContext& context, int number) {
  const GridFacts& grid = *context.grid(number);
  const std::vector<GridRectangle> cover = context.coverOf(number);
  const int size = grid.blockSize;
  Deepest deepest;
  for (int k = 0; k < grid.lowestOfBlocks.endK(); ++k) {
    if (!(-double{grid.lowestOfRows[static_cast<std::size_t>(k)]} > deepest.depth)) continue;
    const std::span<const float> row = grid.lowestOfBlocks.row(k);
    for (int j = 0; j < grid.lowestOfBlocks.endJ(); ++j) {
      const double depth = -double{row[static_cast<std::size_t>(j)]};
      if (!(depth > deepest.depth)) continue;
      const bool isCovered = std::ranges::any_of(cover, [&](const GridRectangle& area) {
        return area.firstJ <= (j + 1) * size - 1 && j * size <= area.lastJ &&
               area.firstK <= (k + 1) * size - 1 && k * size <= area.lastK;
      });
      if (!isCovered) deepest = {depth, grid.lowestPoint(j, k)};
    }
  }
  return deepest;
}

constexpr double kStableCourant = 5;
constexpr double kLongestStep = 86400;

// Whether an engine takes a time step of so many seconds.
bool isStep(double seconds) {
  return seconds > 0 && seconds <= kLongestStep;
}

// The greatest Courant number of all areas for a time step (s), and where it is; 0 where no water is known.
struct Courant {
  double number = 0;
  int area = 0;
  Deepest where;
};

Courant worstCourant(AdviceContext& context, double step) {
  constexpr double kGravity = 9.82;
  Courant worst;
  for (int number = 1; number <= context.model.bathymetry->GetCount(); ++number) {
    const GridFacts* grid = context.grid(number);
    if (grid == nullptr) continue;
    const Deepest deepest = deepestOf(context, number);
    const double courant = step * std::sqrt(kGravity * deepest.depth) / grid->dx;
    if (courant > worst.number && std::isfinite(courant)) worst = {courant, number, deepest};
  }
  return worst;
}

// A whole number by which a step (s, of a day at most) is divided: at least what is wanted for the Courant
// number, and a step with few digits if there is one near.
int stableDivisor(double step, const Courant& worst) {
  constexpr double kMostTimes = 1e9;
  constexpr double kRounding = 1 + 1e-6;  // of a step as a keyword has it
  const auto wanted =
      static_cast<int>(std::clamp(std::ceil(worst.number * kRounding / kStableCourant), 1.0, kMostTimes));
  for (int divisor = wanted; divisor <= 2 * wanted && step * 100 >= divisor; ++divisor) {
    const double hundredths = step / divisor * 100;
    if (std::abs(hundredths - std::round(hundredths)) < 1e-4) return divisor;
  }
  return wanted;
}

// A shorter time step for the same period, or for as much of it as can be counted: what counts time steps
// counts as many more. Nothing where the setup can't be written, which a save tells.
std::optional<AdviceFix> withShorterSteps(AdviceContext& context, int divisor) {
  constexpr std::array<std::string_view, 4> kCounts{"Number_Of_Timesteps", "Time_Step_Interval",
                                                    "Update_Frequency", "InundationFileStoreStep"};
  constexpr long long kMost = std::numeric_limits<std::int32_t>::max() - 1;
  const KvsFile* file = context.written();
  if (file == nullptr) return std::nullopt;
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const double step = double{period.timeStepInterval} / divisor;
  const bool fits = static_cast<long long>(period.LastTimeStep()) * divisor <= kMost;
  AdviceFix fix{fmt::format("Time step of {:.6g} s{}", step, fits ? "" : ", and a shorter run"),
                {{fmt::format("{}/Time_Step_Interval", kPeriodPath), fmt::format("{:.7g}", step)}}};
  eachKeyword(*file, [&](const PagePlace& place, const Node& keyword) {
    const bool isCount =
        keyword.values().size() == 1 && keyword.values()[0].kind() == ValueKind::integer &&
        std::ranges::any_of(kCounts, [&](std::string_view name) { return sameName(name, keyword.name()); });
    if (!isCount && runStepsIn(keyword) == 0) return;
    std::vector<long long> counts;
    bool isOther = false;
    for (const Value& value : keyword.values()) {
      const long long count = wholeOf(value);
      counts.push_back(count > 0 ? std::min(count * divisor, kMost) : count);
      isOther |= count != counts.back();
    }
    if (isOther && findKeyword(context.model, place.keyword, context.documentPath))
      fix.settings.push_back({place.keyword, fmt::format("{}", fmt::join(counts, ","))});
  });
  return fix;
}

// A code with the values that it can have.
struct Code {
  PagePlace place;
  std::string_view what;
  std::int32_t value;
  std::span<const std::int32_t> allowed;
  std::int32_t usual;
};

void adviseCode(AdviceContext& context, const Code& code) {
  if (std::ranges::find(code.allowed, code.value) != code.allowed.end()) return;
  std::string allowed;
  for (const std::int32_t value : code.allowed)
    allowed += (allowed.empty() ? "" : ", ") + std::to_string(value);
  const std::string of = code.place.thing.empty() ? "" : " of " + code.place.thing;
  context.add({{},
               fmt::format("The {}{} is {}, which is none of {}.", code.what, of, code.value, allowed),
               "The engine knows no such code, and stops or takes another one.",
               code.place,
               {},
               AdviceFix{fmt::format("{} of {}", capital(code.what), code.usual),
                         {{code.place.keyword, std::to_string(code.usual)}}}});
}

template <std::int32_t... values>
inline constexpr std::array<std::int32_t, sizeof...(values)> kCodes{values...};

// The codes of a list, each entry's own.
void adviseCodesOf(AdviceContext& context, PageId page, std::string_view thing, std::string_view path,
                   auto& list, std::string_view what, auto code, std::span<const std::int32_t> allowed,
                   std::int32_t usual) {
  for (int number = 1; number <= list.GetCount(); ++number) {
    adviseCode(context,
               {placeOfEntry(page, thing, {number, list.GetCount()}, fmt::format(fmt::runtime(path), number)),
                what, code(*list.GetItem(number)), allowed, usual});
  }
}

// A warm-up in the first part of a run of so many steps.
Setting warmUpWithin(int steps) {
  constexpr int kPart = 10;
  return {fmt::format("{}/Warm_Up_Period", kPeriodPath), std::to_string(steps / kPart)};
}

// The last time step that anything of the setup goes to; 0 where nothing says so.
int lastStepWritten(AdviceContext& context) {
  const KvsFile* file = context.written();
  if (file == nullptr) return 0;
  long long last = 0;
  eachKeyword(*file, [&](const PagePlace&, const Node& keyword) {
    if (sameName("Warm_Up_Period", keyword.name())) return;
    for (int i = 0; i < runStepsIn(keyword); ++i)
      last = std::max(last, wholeOf(keyword.values()[static_cast<std::size_t>(i)]));
  });
  constexpr long long kMost = std::numeric_limits<std::int32_t>::max() - 1;
  return static_cast<int>(std::min(last, kMost));
}

void adviseNumbersOfSteps(AdviceContext& context) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  if (!isStep(period.timeStepInterval) && !context.isHotStart()) {
    constexpr double kUsual = 30;
    const double stable = kUsual / stableDivisor(kUsual, worstCourant(context, kUsual));
    // In hundredths, and no longer than lets the run end with its series.
    constexpr double kRounding = 1e-4;
    const double covered =
        std::floor(secondsOfSeries(context) / period.LastTimeStep() * 100 + kRounding) / 100;
    const std::string usual = fmt::format("{:.6g}", covered > 0 ? std::min(stable, covered) : stable);
    context.add({{},
                 fmt::format("The time step is {:.6g} s.", period.timeStepInterval),
                 "No engine takes a step that is not above 0, or is longer than a day.",
                 onPeriod("Time_Step_Interval", "Time step interval:"),
                 {},
                 AdviceFix{fmt::format("Time step of {} s", usual),
                           {{fmt::format("{}/Time_Step_Interval", kPeriodPath), usual}}}});
  }
  if (period.LastTimeStep() < 1) {
    constexpr int kUsual = 100;
    const int written = lastStepWritten(context);
    const int steps = written > 0 ? written : kUsual;
    AdviceFix fix{
        fmt::format("{} time steps{}", steps, written > 0 ? ", up to the last one that is written" : ""),
        {{fmt::format("{}/Number_Of_Timesteps", kPeriodPath), std::to_string(steps)}}};
    if (period.warmUpPeriod > steps) fix.settings.push_back(warmUpWithin(steps));
    context.add({{},
                 fmt::format("The simulation has {} time steps.", period.LastTimeStep()),
                 "The run ends where it begins, and calculates nothing.",
                 onPeriod("Number_Of_Timesteps", "Last:"),
                 {},
                 std::move(fix)});
  }
}

void adviseCounts(AdviceContext& context) {
  const auto most = [&](PageId page, std::string keyword, std::string_view field, std::string_view what,
                        int count, int limit) {
    if (count <= limit) return;
    const int over = count - limit;
    context.add({{},
                 fmt::format("There are {} {}s.", count, what),
                 fmt::format("Engines take at most {}.", limit),
                 {page, {}, keyword, std::string(field)},
                 {},
                 AdviceFix{over == 1 ? fmt::format("The last {} out", what)
                                     : fmt::format("The last {} {}s out", over, what),
                           {{keyword, std::to_string(limit)}}}});
  };
  CGlobalKvs& model = context.model;
  most(PageId::hdResult, "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/Number_Of_Output_areas",
       "Number of Output Areas", "output", model.nhdResult->outputs.GetCount(), CNhdResultKvs::kMostOutputs);
  most(PageId::massBudget, "NESTED_MODEL_GLOBALS/MASS_BUDGET/NoOfPolygons", "&Number of polygons:", "polygon",
       model.massBudget->GetCount(), CMassBudgetKvs::kMostOnPage);
  most(PageId::weirs, "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/WEIR/number_of_weirs", "Number of weirs", "weir",
       model.nhdWeir->GetCount(), LineStructure::kMost);
  most(PageId::culverts, "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/CULVERTS/number_of_Culverts",
       "Number of culverts", "culvert", model.nhdCulvert->GetCount(), LineStructure::kMost);
}

}  // namespace

void adviseCourant(AdviceContext& context) {
  const double step = context.model.simulationPeriod->timeStepInterval;
  if (!isStep(step) || context.isHotStart()) return;
  const Courant worst = worstCourant(context, step);
  if (!(worst.number > kStableCourant)) return;
  const int divisor = stableDivisor(step, worst);
  constexpr double kShortest = 0.01;  // that a check takes
  if (step / divisor < kShortest) return;
  std::optional<AdviceFix> fix = withShorterSteps(context, divisor);
  if (!fix) return;
  context.add({{},
               fmt::format("The Courant number is {:.3g} in area {}, {:.4g} m deep; beyond {} a run is often "
                           "unstable. A time step of {:.6g} s would do.",
                           worst.number, worst.area, worst.where.depth, kStableCourant, step / divisor),
               "The fastest waves cross more grid spacings in a time step than the scheme follows.",
               onPeriod("Time_Step_Interval", "Time step interval:"),
               {.area = worst.area, .points = {worst.where.point}},
               std::move(*fix)});
}

void adviseThresholds(AdviceContext& context) {
  const CAreaDescriptionKvs& thresholds = *context.model.areaDescription;
  constexpr float kMostTimes = 5;
  constexpr float kUsualTimes = 2;
  const float drying = thresholds.dryingDepth;
  const float flooding = thresholds.floodingDepth;
  if (thresholds.enableFloodAndDryChecking == 0 || !(drying > 0) || !(flooding > kMostTimes * drying)) return;
  const std::string keyword = "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth";
  context.add({{},
               fmt::format("The flooding depth of {:.6g} m is {:.3g} times the drying depth of {:.6g} m.",
                           flooding, flooding / drying, drying),
               "Points that have run dry stay out for long, and much water comes and goes when they change.",
               {PageId::floodAndDry, {}, keyword, "Flooding depth:"},
               {},
               AdviceFix{fmt::format("Flooding depth of {:.6g} m", kUsualTimes * drying),
                         {{keyword, fmt::format("{:.6g}", kUsualTimes * drying)}}}});
}

void adviseWarmUp(AdviceContext& context) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  if (period.LastTimeStep() < 1 || period.warmUpPeriod <= period.LastTimeStep()) return;
  context.add({{},
               fmt::format("The warm-up ends at time step {}, the run at {}.", period.warmUpPeriod,
                           period.LastTimeStep()),
               "The boundaries never come to their full values.",
               onPeriod("Warm_Up_Period", "Last:", 2),
               {},
               AdviceFix{"Warm-up in the first tenth of the run", {warmUpWithin(period.LastTimeStep())}}});
}

void adviseCodes(AdviceContext& context) {
  CGlobalKvs& model = context.model;
  adviseNumbersOfSteps(context);
  const auto one = [&](PageId page, std::string_view keyword, std::string_view field, std::string_view what,
                       std::int32_t value, std::span<const std::int32_t> allowed, std::int32_t usual) {
    adviseCode(context, {{page, {}, std::string(keyword), std::string(field)}, what, value, allowed, usual});
  };
  const CModuleSelectionKvs& modules = *model.moduleSelection;
  one(PageId::moduleSelection, "NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type", "Module",
      "module code", modules.simulationType, kCodes<0, 2, 3, 8, 9, 11>, 0);
  one(PageId::moduleSelection, "NESTED_MODEL_GLOBALS/MODULE_SELECTION/AD_Scheme",
      "Select scheme:", "code of the scheme", modules.adScheme, kCodes<1, 5, -5, -1>, 1);
  one(PageId::bathymetry, "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Hot_Start", "Type", "type of the start",
      model.bathymetry->hotStart, kCodes<0, 1>, 0);
  one(PageId::boundary, "NESTED_MODEL_GLOBALS/OPEN_BOUNDARY/Default_Position", "Default position",
      "way to place boundaries", model.boundary->defaultPosition, kCodes<0, 1>, 0);
  one(PageId::windConditions, "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/Data_Format", "Wind type:", "wind type",
      model.windConditions->dataFormat, kCodes<0, 1, 2, 3>, 0);
  one(PageId::windConditions, "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/Type_Of_Wind_Friction",
      "Friction type:", "type of the wind's friction", model.windConditions->frictionType, kCodes<0, 1>, 0);
  one(PageId::eddyViscosity, "HYDRODYNAMIC_MODULE/EDDY_VISCOSITY/Data_Format", "",
      "type of the eddy viscosity", model.nhdEddyViscosity->dataFormat, kCodes<0, 1, 2, 3>, 0);
  one(PageId::resistance, "HYDRODYNAMIC_MODULE/RESISTANCE/Formulation", "", "formulation of the resistance",
      model.nhdResistance->formulation, kCodes<0, 1, 2>, 0);
  one(PageId::infiltration, "HYDRODYNAMIC_MODULE/INFILTRATION/InfiltrationType", "",
      "type of the infiltration", model.nhdInfiltration->infiltrationType, kCodes<0, 1, 2>, 0);

  using Flow = CNhdBoundaryObjectKvs;
  const auto atBoundary = [&](std::string_view keyword, std::string_view what, std::int32_t Flow::*code,
                              std::span<const std::int32_t> allowed, std::int32_t usual) {
    adviseCodesOf(
        context, PageId::hdBoundary, "boundary",
        fmt::format("HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_{{}}/{}", keyword), *model.nhdBoundary, what,
        [code](const Flow& item) { return item.*code; }, allowed, usual);
  };
  atBoundary("Formulation", "formulation", &Flow::formulation, kCodes<1, 2>, 1);
  atBoundary("Data_Format", "data format", &Flow::dataFormat, kCodes<1, 2, 3, 4, 5, 7>, 1);
  atBoundary("FAB_Type", "FAB type", &Flow::fabType, kCodes<0, 1, 2, 12>, 12);
  atBoundary("Tilt_Type", "tilt type", &Flow::tiltType, kCodes<-1, 0, 1>, -1);
  adviseCodesOf(
      context, PageId::sourceAndSink, "source", "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_{}/Type",
      *model.sourceSink, "type", [](const auto& item) { return item.type; }, kCodes<0, 1, 2>, 0);
  adviseCodesOf(
      context, PageId::hdSourceAndSink, "source",
      "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/SOURCE_SINK_{}/Data_Format", *model.nhdSourceSink, "data format",
      [](const auto& item) { return item.dataFormat; }, kCodes<0, 1>, 0);
  adviseCodesOf(
      context, PageId::resistance, "area", "HYDRODYNAMIC_MODULE/RESISTANCE/AREA_{}/Data_Format",
      *model.nhdResistance, "data format", [](const auto& item) { return item.dataFormat; }, kCodes<0, 1, 2>,
      1);
  adviseCodesOf(
      context, PageId::surfaceElevation, "area", "HYDRODYNAMIC_MODULE/SURFACE_ELEVATION/AREA_{}/Type",
      *model.nhdSurfaceElevation, "type", [](const auto& item) { return item.type; }, kCodes<1, 2>, 1);
  adviseCodesOf(
      context, PageId::hdResult, "output", "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/OUTPUT_AREA_{}/Type",
      model.nhdResult->outputs, "type", [](const auto& item) { return item.type; }, kCodes<0, 1, 2>, 2);
  adviseCodesOf(
      context, PageId::culverts, "culvert",
      "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE/CULVERTS/Culvert_data[{}]/Geometry/Type", *model.nhdCulvert,
      "geometry type", [](const auto& item) { return item.geometryType; }, kCodes<0, 1, 2>, 0);
  adviseCounts(context);
}

}  // namespace gridbay
