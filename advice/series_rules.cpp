// Doubts about the data files whose values the run goes through, in all modules that are in use.

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <filesystem>
#include <limits>

#include "advice/rules.h"
#include "advice/run_steps.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "core/letters.h"
#include "platform/files/paths.h"
#include "platform/units/units.h"
#include "setup/member_keyword.h"
#include "setup/page_places.h"
#include "setup/skeleton.h"

namespace gridbay {
namespace {

// A file whose values the run goes through.
struct UsedSeries {
  PagePlace place;
  const CheckedFile& file;
  bool isSmooth = false;                   // its values go on without jumps in nature
  std::vector<std::string> keywords = {};  // all that name it
};

constexpr double kHalfSecond = 0.5 / 86400;  // days

std::string momentOf(const DateTime& origin, const CVdUnitConverter& toDays, const TsbTimeAxis& time,
                     std::size_t step) {
  return dateTimeText(origin.plusDays(toDays.Convert(time.at(step))));
}

constexpr std::string_view kPeriodPath = "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD";
constexpr double kDay = 86400;  // seconds

// Gives what counts the run's time steps other numbers: those of keywords that the model holds.
void addSteps(AdviceContext& context, AdviceFix& fix, const std::function<long long(long long)>& moved) {
  const KvsFile* file = context.written();
  if (file == nullptr) return;
  eachKeyword(*file, [&](const PagePlace& place, const Node& keyword) {
    const int steps = runStepsIn(keyword);
    if (steps == 0) return;
    const bool isOfWarmUp = sameName("Warm_Up_Period", keyword.name());
    std::vector<long long> values;
    bool isOther = false;
    for (const Value& value : keyword.values()) {
      const long long step = wholeOf(value);
      long long now = step;
      if (static_cast<int>(values.size()) < steps)
        now = isOfWarmUp ? std::min(step, moved(std::numeric_limits<int>::max())) : moved(step);
      isOther |= now != step;
      values.push_back(now);
    }
    if (isOther && findKeyword(context.model, place.keyword, context.documentPath))
      fix.settings.push_back({place.keyword, fmt::format("{}", fmt::join(values, ","))});
  });
}

// A run of fewer time steps, with what is written until then.
AdviceFix shorterRun(AdviceContext& context, long long steps) {
  AdviceFix fix{"End with the series",
                {{fmt::format("{}/Number_Of_Timesteps", kPeriodPath), std::to_string(steps)}}};
  addSteps(context, fix, [steps](long long step) { return std::min(step, steps); });
  return fix;
}

// A run that begins so many time steps later, and ends when it did; nothing where that is no date.
std::optional<AdviceFix> laterRun(AdviceContext& context, long long later) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const long long steps = period.LastTimeStep() - later;
  const DateTime start =
      period.start.plusDays(static_cast<double>(later) * double{period.timeStepInterval} / kDay);
  const auto parts = start.parts();
  if (!parts) return std::nullopt;
  const auto [year, month, day, hour, minute, second] = *parts;
  AdviceFix fix{"Begin with the series",
                {{fmt::format("{}/Start_Time", kPeriodPath),
                  fmt::format("{},{},{},{},{},{}", year, month, day, hour, minute, second)},
                 {fmt::format("{}/Number_Of_Timesteps", kPeriodPath), std::to_string(steps)}}};
  addSteps(context, fix, [=](long long step) { return std::clamp(step - later, 0LL, steps); });
  return fix;
}

// Whether the file covers the run.
void advisePeriod(AdviceContext& context, const UsedSeries& used, const TsbTimeAxis& time,
                  const DateTime& origin, const CVdUnitConverter& toDays) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const DateTime first = origin.plusDays(toDays.Convert(time.at(0)));
  const DateTime last = origin.plusDays(toDays.Convert(time.at(time.count - 1)));
  const DateTime end = period.End();
  if (!first.valid() || !last.valid() || !end.valid() || !period.start.valid()) return;
  constexpr const char* kReason = "Beyond it the engine has no values, and stops.";
  constexpr const char* kTodo = "Choose a series that covers the run, or move the run to where there is one.";
  const double stepsInDay = kDay / double{period.timeStepInterval};
  if (first.linear() > period.start.linear() + kHalfSecond) {
    Advice advice{{},
                  fmt::format("{} begins at {}, after the run does at {}.", used.file.name,
                              dateTimeText(first), dateTimeText(period.start)),
                  kReason,
                  used.place,
                  {},
                  {},
                  kTodo};
    const double later = std::ceil((first.linear() - period.start.linear() - kHalfSecond) * stepsInDay);
    // A series with no dates begins with the run, and would move with it.
    if (time.isCalendar() && later >= 1 && later < period.LastTimeStep())
      advice.fix = laterRun(context, static_cast<long long>(later));
    context.add(std::move(advice));
  }
  if (last.linear() >= end.linear() - kHalfSecond) return;
  Advice advice{{},
                fmt::format("{} ends at {}, in the run, which ends at {}.", used.file.name,
                            dateTimeText(last), dateTimeText(end)),
                kReason,
                used.place,
                {},
                {},
                kTodo};
  const double steps = std::floor((last.linear() - period.start.linear() + kHalfSecond) * stepsInDay);
  if (steps >= 1 && steps < period.LastTimeStep())
    advice.fix = shorterRun(context, static_cast<long long>(steps));
  context.add(std::move(advice));
}

// A series without gaps beside the setup, for all that take the one with gaps.
std::optional<AdviceFix> withoutGaps(AdviceContext& context, const UsedSeries& used,
                                     const SeriesFacts& facts) {
  const auto hasValues = [&](const SeriesFacts::Item& item) { return item.missing < facts.file.time.count; };
  if (!facts.file.axes.empty() || used.keywords.empty() || context.documentPath.empty() ||
      !std::ranges::all_of(facts.items, hasValues))
    return std::nullopt;
  // Between 350 and 10 degrees lies north, and not the mean of both.
  constexpr std::array kDirections{item::kWindDirection, item::kMeanWaveDirection, item::kWaveDirection,
                                   item::kFlowDirection};
  for (std::size_t i = 0; i < facts.items.size(); ++i) {
    if (facts.items[i].missing > 0 && std::ranges::count(kDirections, facts.file.items[i].type) > 0)
      return std::nullopt;
  }
  const std::filesystem::path path(used.file.path);
  const std::string name = context.freeName(path.stem().string() + "_filled" + path.extension().string());
  AdviceFix fix{fmt::format("Fill the gaps, in {}", name)};
  for (const std::string& keyword : used.keywords) fix.settings.push_back({keyword, name});
  fix.files.push_back(
      {used.file.path, absolutePath(name, folderOfFile(context.documentPath)), FilledSeries{}});
  return fix;
}

void adviseValues(AdviceContext& context, const UsedSeries& used, const SeriesFacts& facts,
                  std::uint32_t number, const std::function<std::string(std::size_t)>& moment) {
  const SeriesFacts::Item& item = facts.items[number - 1];
  const TsbItem& named = facts.file.items[number - 1];
  if (item.missing > 0) {
    context.add(
        {{},
         fmt::format("\"{}\" of {} has {} missing value{}, the first at {}.", named.name, used.file.name,
                     item.missing, item.missing == 1 ? "" : "s", moment(item.firstMissing)),
         "What the engine takes in their place is not known.",
         used.place,
         {},
         withoutGaps(context, used, facts),
         "Fill them from another source, and choose the file that has them all."});
  }
  // A smooth curve that is sampled well goes no such way in one step.
  constexpr std::size_t kLeastSteps = 10;
  constexpr float kMostPart = 0.6F;
  const float range = item.highest - item.lowest;
  if (!used.isSmooth || facts.file.time.count < kLeastSteps || !(item.greatestJump > kMostPart * range) ||
      range <= 0)
    return;
  context.add({{},
               fmt::format("\"{}\" of {} jumps from {:.4g} to {:.4g} {} between {} and {}.", named.name,
                           used.file.name, item.before, item.after, named.unit, moment(item.jumpStep - 1),
                           moment(item.jumpStep)),
               "A wave that is none in nature runs through the model; often a value is mistyped.",
               used.place,
               {},
               {},
               "Look at the series there, and mend its source where a value is wrong."});
}

void adviseOne(AdviceContext& context, const UsedSeries& used) {
  if (used.file.path.empty()) return;
  const SeriesFacts* facts = context.files.series(used.file.path);
  if (facts == nullptr || facts->file.time.count == 0) return;
  const TsbTimeAxis& time = facts->file.time;
  const CVdUnitConverter toDays(time.unit, "d");
  // A single map holds throughout, and so may a relative axis that is none of time.
  const DateTime origin =
      time.isCalendar() ? DateTime::of(time.start) : context.model.simulationPeriod->start;
  const bool isOfTime = toDays.IsValid() && origin.valid();
  if (isOfTime && time.count > 1) advisePeriod(context, used, time, origin, toDays);
  if (!facts->hasValues) return;
  const auto moment = [&](std::size_t step) {
    return isOfTime ? momentOf(origin, toDays, time, step)
                    : fmt::format("{:.6g} {}", time.at(step), time.unit);
  };
  std::vector<std::uint32_t> items = used.file.items;
  if (items.empty()) {
    for (std::uint32_t number = 1; number <= facts->items.size(); ++number) items.push_back(number);
  }
  for (const std::uint32_t number : items) {
    if (number >= 1 && number <= facts->items.size()) adviseValues(context, used, *facts, number, moment);
  }
}

// A keyword that names a data file.
struct NameOnFile {
  PagePlace place;
  std::string path;
};

std::vector<NameOnFile> namesOnFile(AdviceContext& context) {
  std::vector<NameOnFile> names;
  const KvsFile* file = context.written();
  if (file == nullptr) return names;
  const std::string folder = folderOfFile(context.documentPath);
  eachKeyword(*file, [&](const PagePlace& place, const Node& keyword) {
    if (keyword.values().size() != 1 || keyword.values()[0].kind() != ValueKind::fileName) return;
    const std::string name(keyword.values()[0].text());
    if (!name.empty()) names.push_back({place, absolutePath(name, folder)});
  });
  return names;
}

// Where a file is chosen that a check has looked at.
PagePlace placeOf(const CheckedFile& file, const std::vector<NameOnFile>& names) {
  PagePlace place{.page = file.page,
                  .thing = thingOf(file.page, file.entries),
                  .value = file.name,
                  .entries = file.entries};
  const auto isOf = [&](const NameOnFile& each) {
    const auto isSame = [](const ListEntry& a, const ListEntry& b) { return a.number == b.number; };
    return each.place.page == file.page && each.path == file.path &&
           std::ranges::equal(each.place.entries, file.entries, isSame);
  };
  if (const auto found = std::ranges::find_if(names, isOf); found != names.end())
    place.keyword = found->place.keyword;
  return place;
}

// Levels and fluxes at boundaries go on smoothly; their directions need not.
bool isSmooth(const PagePlace& place) {
  return place.page == PageId::hdBoundary && !place.entries.empty() &&
         place.keyword.ends_with(fmt::format("/BOUNDARY_{}/File_Name", place.entries.front().number));
}

}  // namespace

// Which files are in use, and for what, the checks know. They may change the model, which is to stay as it
// is; that of the grids reads them whole, and has no series.
void adviseSeries(AdviceContext& context) {
  CGlobalKvs copy;
  copy.AssignState(context.model);
  ValidationList checked;
  for (const CheckRow& row : checkingOrder()) {
    if (!holds(row.condition, copy)) continue;
    CKvsBase& object = row.object(copy);
    if (&object != copy.bathymetry.get()) object.Validate(checked, 1);
  }
  const std::vector<NameOnFile> names = namesOnFile(context);
  for (const CheckedFile& file : checked.files) {
    if (!file.coversRun) continue;
    PagePlace place = placeOf(file, names);
    const bool smooth = isSmooth(place);
    std::vector<std::string> keywords;
    for (const NameOnFile& each : names) {
      if (each.path == file.path) keywords.push_back(each.place.keyword);
    }
    adviseOne(context, {std::move(place), file, smooth, std::move(keywords)});
  }
}

}  // namespace gridbay
